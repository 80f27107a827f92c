// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ClashingRows.h"

#include "FurtherKeys.h"
#include "IShortcutObject.h"
#include "ShortcutRows.h"
#include "ShortcutsModel.h"

#include <algorithm>

namespace {

bool clash(const QKeySequence &left, const QKeySequence &right)
{
    return !left.isEmpty() && !right.isEmpty()
        && (left.matches(right) != QKeySequence::NoMatch || right.matches(left) != QKeySequence::NoMatch);
}

bool hasClashingFurtherKey(const IShortcutObject &object, const QKeySequence &key)
{
    const QList<QKeySequence> further = FurtherKeys::of(object);
    return std::any_of(further.begin(), further.end(),
                       [&key](const QKeySequence &other) { return clash(other, key); });
}

} // namespace

QHash<QString, ClashingRows::Rows> ClashingRows::of(const ShortcutsModel &model, const QKeySequence &key)
{
    QHash<QString, Rows> rows;
    for (int group = 0; group < model.rowCount(); ++group) {
        const QVector<const IShortcutObject *> objects = ShortcutRows::ofGroup(model, group);
        for (int row = 0; row < objects.size(); ++row) {
            const IShortcutObject *object = objects.at(row);
            const bool isPending = object && clash(object->keySequence(), key);
            if (!object || (!isPending && !hasClashingFurtherKey(*object, key)))
                continue;
            const QModelIndex index = model.index(row, 0, model.index(group, 0));
            Rows &ofName = rows[object->name()];
            if (!ofName.first.isValid())
                ofName.first = index;
            if (isPending)
                ofName.pending.append(index);
        }
    }
    return rows;
}
