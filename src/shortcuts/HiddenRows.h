// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "ShortcutIndex.h"

#include <QPersistentModelIndex>
#include <QVector>

class QTreeView;

/**
 * Which rows of a tree on a ShortcutsModel are hidden: those that show nothing, those that are
 * filtered out, and groups of such rows alone.
 */
class HiddenRows
{
public:
    explicit HiddenRows(QTreeView *view);

    /// Hides the rows of \a model that show nothing.
    void hideEmpty(const ShortcutsModel &model);
    /// Hides the rows of \a model that \a matches has not; returns how many it has.
    int hideOthers(const ShortcutsModel &model, const ShortcutIndex::Matches &matches);
    /// Shows all rows again.
    void showAll();
    /// Forgets what it has hidden: the view has another model.
    void forget() { m_hidden.clear(); }

private:
    void hide(const QModelIndex &index);

    QTreeView *const m_view;
    QVector<QPersistentModelIndex> m_hidden;
};
