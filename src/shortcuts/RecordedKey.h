// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <Qt>

/**
 * Which of the keys that a keyboard sends can be a chord of a shortcut.
 */
namespace RecordedKey {

/// Whether a key is one of the four modifiers that a chord is made with.
bool isModifier(int key);

/**
 * Whether a key makes a chord.
 *
 * Modifiers, locks, and the keys that shift a level, compose or are dead make none, nor does a
 * key that would not be the same again after it was saved.
 *
 * @param key what the keyboard sent, a Qt::Key
 * @param modifiers the modifiers held meanwhile
 */
bool isChord(int key, Qt::KeyboardModifiers modifiers);

} // namespace RecordedKey
