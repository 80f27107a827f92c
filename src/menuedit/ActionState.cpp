// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ActionState.h"

ActionState ActionState::of(const Selection &selection)
{
    ActionState state;
    if (!selection.any)
        return state;
    state.create = selection.writable;
    state.edit = selection.writable;
    state.paste = selection.writable && selection.filesOnClipboard;
    const bool isMovable = selection.writable && !selection.isByTime;
    state.up = isMovable && selection.row != 0;
    state.down = isMovable && selection.row != selection.count - 1;
    return state;
}
