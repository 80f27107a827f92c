// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QByteArray>
#include <QString>

#include <cstddef>
#include <optional>

/**
 * The names of keys: key strings ("Ctrl+Alt+Mod4+F2"), as the window manager writes them, and
 * what Qt calls the same keys.
 */
namespace KeyNames {

/// The X11 bits of all modifiers that a key string can name.
constexpr unsigned int AllModifiers = 0x4d;

/**
 * Looks a modifier up.
 *
 * @param name one of its names, in any case; not terminated
 * @param length the length of the name
 * @return its X11 bit; 0 when no modifier has that name
 */
unsigned int modifierBit(const char *name, std::size_t length);

/// The key string of a Qt key code, see VelKeyServer::KeyQtToKeyStringX().
QString toKeyString(int code);

/// The portable text that a key string stands for, see VelKeyServer::KeyStringXToQt().
QString fromKeyString(const QString &keyString);

/**
 * Reads a key string.
 *
 * @param keyString its bytes in the local 8-bit encoding
 * @return the Qt key code, key and modifiers; nothing when the key string is rejected
 */
std::optional<int> codeFromKeyString(const QByteArray &keyString);

/// The portable text of the key sequence of one key code; empty when it has none.
QString portableText(int code);

/**
 * Whether portableText() of a key code is known to read back as that same key code.
 *
 * That holds for ASCII keys and the usual named keys. Others (a lower-case letter outside of
 * ASCII, for instance) may read back as another code.
 */
bool roundTrips(int code);

} // namespace KeyNames
