// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QByteArray>
#include <QString>

#include <optional>

namespace KeyNames {

/**
 * Reads a key string ("Ctrl+Alt+F2").
 *
 * @param keyString its bytes in the local 8-bit encoding
 * @return the Qt key code, key and modifiers; nothing when the key string is rejected
 */
std::optional<int> codeFromKeyString(const QByteArray &keyString);

/// The Qt modifiers of an X11 modifier mask.
int qtModifiers(unsigned int mask);

/// The portable text of the key sequence of one key code; empty when it has none.
QString portableText(int code);

/**
 * Whether portableText() of a key code is known to read back as that same key code.
 *
 * That holds for ASCII keys and the usual named keys. Others (a lower-case letter outside of
 * ASCII, for instance) may read back as another code.
 */
bool readsBackUnchanged(int code);

} // namespace KeyNames
