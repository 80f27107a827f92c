// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QKeySequence>
#include <QString>

class IShortcutObject;

namespace ShownKeys {

/// All keys of a shortcut in one text, the pending one first; empty when it has none.
QString of(const IShortcutObject &object, QKeySequence::SequenceFormat format = QKeySequence::PortableText);

/**
 * How long the text of a shortcut's keys is, in characters, with what stands beside it when it is
 * changed.
 *
 * Guessed without making the text: good enough to tell which few of many may be the longest.
 */
int roughLength(const IShortcutObject &object);

} // namespace ShownKeys
