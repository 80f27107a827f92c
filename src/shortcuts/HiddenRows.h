// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "ShortcutIndex.h"

class QModelIndex;
class QTreeView;

/**
 * Which rows of a tree on a ShortcutsModel are hidden: those that show nothing, those that are
 * filtered out, and groups of such rows alone.
 *
 * It tells the tree of what changes only: most rows are as they were from one key press to the next.
 */
class HiddenRows
{
public:
    explicit HiddenRows(QTreeView *view);

    /// The view has \a model anew, with all rows shown.
    void start(const ShortcutsModel &model);
    /// Rows came or went: what was hidden has moved.
    void forget() { m_shown.clear(); }
    /// Shows the rows of \a model that \a matches has, and no others; returns how many these are.
    int show(const ShortcutsModel &model, const ShortcutIndex::Matches &matches);
    /// All rows of \a model but those that show nothing.
    static ShortcutIndex::Matches notEmpty(const ShortcutsModel &model);

private:
    int showGroup(const QModelIndex &header, const QVector<bool> &matches, const QVector<bool> &before);

    QTreeView *const m_view;
    ShortcutIndex::Matches m_shown; // empty while that is not known
};
