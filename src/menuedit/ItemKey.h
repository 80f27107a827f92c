// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <Qt>

/**
 * What a key does to the item that the keyboard is on; knows no widget.
 */
namespace ItemKey {

enum class Use {
    None, ///< Nothing: the key is left to others, such as the default button of a dialog.
    Edit,
    Toggle ///< Opens a closed folder and closes an open one.
};

/// What \a key does, pressed together with \a modifiers; \a isEditable tells of the menu.
Use of(int key, Qt::KeyboardModifiers modifiers, bool isEditable, bool isFolder);

} // namespace ItemKey
