// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QPair>
#include <QVector>

class IShortcutObject;
class ShortcutsModel;

/**
 * Reads all rows of a ShortcutsModel in one walk.
 *
 * The model finds what a single index stands for by a walk through its group; for all rows one
 * after the other that would take time by the square of their number.
 */
class ShortcutRows
{
public:
    /// What the rows of a group show, in their order; null for a row that shows nothing.
    static QVector<const IShortcutObject *> ofGroup(const ShortcutsModel &model, int group);

    /// Group and row of every row that shows nothing.
    static QVector<QPair<int, int>> empty(const ShortcutsModel &model);
};
