// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "HiddenRows.h"

#include "ShortcutRows.h"
#include "ShortcutsModel.h"

#include <QTreeView>

namespace {

ShortcutIndex::Matches allOf(const ShortcutsModel &model)
{
    ShortcutIndex::Matches all(model.rowCount());
    for (int group = 0; group < all.size(); ++group)
        all[group] = QVector<bool>(model.rowCount(model.index(group, 0)), true);
    return all;
}

} // namespace

HiddenRows::HiddenRows(QTreeView *view)
    : m_view(view)
{
}

ShortcutIndex::Matches HiddenRows::notEmpty(const ShortcutsModel &model)
{
    ShortcutIndex::Matches matches = allOf(model);
    const auto rows = ShortcutRows::empty(model);
    for (const auto &[group, row] : rows)
        matches[group][row] = false;
    return matches;
}

void HiddenRows::start(const ShortcutsModel &model)
{
    m_shown = allOf(model);
}

int HiddenRows::show(const ShortcutsModel &model, const ShortcutIndex::Matches &matches)
{
    int shown = 0;
    for (int group = 0; group < matches.size(); ++group) {
        const QModelIndex header = model.index(group, 0);
        const int shownHere = showGroup(header, matches.at(group), m_shown.value(group));
        if (m_view->isRowHidden(group, {}) != (shownHere == 0))
            m_view->setRowHidden(group, {}, shownHere == 0);
        shown += shownHere;
    }
    m_shown = matches;
    return shown;
}

int HiddenRows::showGroup(const QModelIndex &header, const QVector<bool> &matches,
                          const QVector<bool> &before)
{
    const bool isKnown = matches.size() == before.size();
    int shown = 0;
    for (int row = 0; row < matches.size(); ++row) {
        const bool isShown = matches.at(row);
        if (!isKnown || before.at(row) != isShown)
            m_view->setRowHidden(row, header, !isShown);
        shown += isShown ? 1 : 0;
    }
    return shown;
}
