// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QKeySequence>

class IShortcutObject;

/**
 * Which shortcuts a user has changed, now or before, and the way back.
 */
namespace ShortcutChange {

/// Whether the pending key is not the one in force: an edit.
bool isEdited(const IShortcutObject &object);
/// Whether the pending key is not the default key, or an edit.
bool isChanged(const IShortcutObject &object);
/// The key that the way back leads to: the one in force after an edit, else the default key.
QKeySequence keyBefore(const IShortcutObject &object);

} // namespace ShortcutChange
