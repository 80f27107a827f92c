// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QPair>
#include <QVector>

class IShortcutObject;
class QModelIndex;
class ShortcutsModel;

/**
 * Reads the rows of a ShortcutsModel, all of them in one walk.
 *
 * The model finds what a single index stands for by a walk through its group; for all rows one
 * after the other that would take time by the square of their number.
 */
class ShortcutRows
{
public:
    /// What the rows of a group show, in their order; null for a row that shows nothing.
    static QVector<const IShortcutObject *> ofGroup(const ShortcutsModel &model, int group);

    /// What the row of \a index shows; null for a group, and for a row that shows nothing.
    static const IShortcutObject *at(const ShortcutsModel &model, const QModelIndex &index);

    /// Whether the pending key of any row is not the one in force.
    static bool isAnyEdited(const ShortcutsModel &model);

    /// Group and row of every row that shows nothing.
    static QVector<QPair<int, int>> empty(const ShortcutsModel &model);
};
