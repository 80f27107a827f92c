// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ShortcutRows.h"

#include "ShortcutChange.h"
#include "ShortcutsModel.h"

#include <algorithm>

QVector<const IShortcutObject *> ShortcutRows::ofGroup(const ShortcutsModel &model, int group)
{
    const ShortcutsModel::Group &names = model.m_groups.at(group);
    QVector<const IShortcutObject *> rows;
    rows.reserve(names.size());
    for (const ShortcutsModel::Objects &objects : names)
        rows.append(objects.value(0));
    return rows;
}

const IShortcutObject *ShortcutRows::at(const ShortcutsModel &model, const QModelIndex &index)
{
    return model.isShortcutItem(index) ? model.firstObject(index) : nullptr;
}

// Also those that share a row with another one: they take part in what is reset and committed.
bool ShortcutRows::isAnyEdited(const ShortcutsModel &model)
{
    for (int group = 0; group < model.rowCount(); ++group) {
        const ShortcutsModel::Group &names = model.m_groups.at(group);
        for (const ShortcutsModel::Objects &objects : names) {
            if (std::any_of(objects.begin(), objects.end(),
                            [](const IShortcutObject *object) { return ShortcutChange::isEdited(*object); }))
                return true;
        }
    }
    return false;
}

QVector<QPair<int, int>> ShortcutRows::empty(const ShortcutsModel &model)
{
    return model.emptyRows();
}
