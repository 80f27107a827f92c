// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ShortcutChange.h"

#include "IShortcutObject.h"
#include "ShortcutRows.h"
#include "ShortcutsModel.h"

#include <algorithm>

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

bool ShortcutChange::isAnyEdited(const ShortcutsModel &model)
{
    for (int group = 0; group < model.rowCount(); ++group) {
        const auto objects = ShortcutRows::ofGroup(model, group);
        if (std::any_of(objects.begin(), objects.end(),
                        [](const IShortcutObject *object) { return object && isEdited(*object); }))
            return true;
    }
    return false;
}
