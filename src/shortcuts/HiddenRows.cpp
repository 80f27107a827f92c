// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "HiddenRows.h"

#include "ShortcutRows.h"
#include "ShortcutsModel.h"

#include <QTreeView>

#include <utility>

HiddenRows::HiddenRows(QTreeView *view)
    : m_view(view)
{
}

void HiddenRows::hideEmpty(const ShortcutsModel &model)
{
    QVector<int> emptyRows(model.rowCount());
    const auto rows = ShortcutRows::empty(model);
    for (const auto &[group, row] : rows) {
        hide(model.index(row, 0, model.index(group, 0)));
        ++emptyRows[group];
    }
    for (int group = 0; group < emptyRows.size(); ++group) {
        const QModelIndex header = model.index(group, 0);
        if (emptyRows.at(group) == model.rowCount(header))
            hide(header);
    }
}

int HiddenRows::hideOthers(const ShortcutsModel &model, const ShortcutIndex::Matches &matches)
{
    int shown = 0;
    for (int group = 0; group < matches.size(); ++group) {
        const QModelIndex header = model.index(group, 0);
        const QVector<bool> &rows = matches.at(group);
        const int shownBefore = shown;
        for (int row = 0; row < rows.size(); ++row) {
            if (rows.at(row))
                ++shown;
            else
                hide(model.index(row, 0, header));
        }
        if (shown == shownBefore)
            hide(header);
    }
    return shown;
}

void HiddenRows::showAll()
{
    const auto hidden = std::exchange(m_hidden, {});
    for (const QPersistentModelIndex &index : hidden) {
        if (index.isValid())
            m_view->setRowHidden(index.row(), index.parent(), false);
    }
}

void HiddenRows::hide(const QModelIndex &index)
{
    m_view->setRowHidden(index.row(), index.parent(), true);
    m_hidden.append(index);
}
