// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ShortcutRows.h"

#include "ShortcutsModel.h"

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

QVector<QPair<int, int>> ShortcutRows::empty(const ShortcutsModel &model)
{
    return model.emptyRows();
}
