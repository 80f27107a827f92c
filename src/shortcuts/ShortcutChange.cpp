// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ShortcutChange.h"

#include "IShortcutObject.h"

bool ShortcutChange::isEdited(const IShortcutObject &object)
{
    return object.keySequence() != object.objectKeySequence();
}

bool ShortcutChange::isChanged(const IShortcutObject &object)
{
    return object.keySequence() != object.defaultKeySequence() || isEdited(object);
}

QKeySequence ShortcutChange::keyBefore(const IShortcutObject &object)
{
    return isEdited(object) ? object.objectKeySequence() : object.defaultKeySequence();
}
