// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ActionState.h"

ActionState ActionState::of(const Selection &selection)
{
    ActionState state;
    if (!selection.any)
        return state;
    state.create = selection.writable;
    state.edit = selection.writable && selection.items == 1;
    state.remove = selection.writable && !selection.isAnyLocked;
    state.paste = selection.writable && selection.filesOnClipboard;
    const bool isMovable = state.remove && selection.areSiblings && !selection.isByTime;
    const int lastRow = selection.items == 1 ? selection.row : selection.lastRow;
    // Several move unless they stand at the end already, side by side.
    state.up = isMovable && lastRow != selection.items - 1;
    state.down = isMovable && selection.row != selection.count - selection.items;
    return state;
}
