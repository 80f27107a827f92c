// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ItemKey.h"

ItemKey::Use ItemKey::of(int key, Qt::KeyboardModifiers modifiers, bool isEditable, bool isFolder)
{
    if (modifiers & ~Qt::KeypadModifier)
        return Use::None;
    const Use edit = isEditable ? Use::Edit : Use::None;
    switch (key) {
    case Qt::Key_F2:
        return edit;
    case Qt::Key_Return:
    case Qt::Key_Enter:
        return isFolder ? Use::Toggle : edit;
    default:
        return Use::None;
    }
}
