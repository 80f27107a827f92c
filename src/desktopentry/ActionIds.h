// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <frame/DesktopEntryRecord.h>

#include <QString>
#include <QStringList>
#include <QVector>

namespace VelUI {

/**
 * What is wrong with the ids of an entry's actions.
 *
 * An entry names its actions by their ids, and has a group for each that is called after it.
 */
namespace ActionIds {

enum class Fault {
    Missing, ///< there is no id
    Equal, ///< an earlier action has the same
    Impossible, ///< no name of a group can hold it
    Odd ///< there are other characters than A to Z, a to z, 0 to 9 and "-" in it
};

struct Problem
{
    int row; ///< of the action
    QString id;
    Fault fault;
    QString proposal; ///< an id that is right and that no other action has
};

/// What is wrong with \a ids, by their rows.
QVector<Problem> problems(const QStringList &ids);

/// Whether an action with such an id would get lost when it is saved.
bool isLost(Fault fault);

QStringList of(const QList<VelUIDesktopAction> &actions);

/// The actions with the proposed ids in the place of those that are wrong.
QList<VelUIDesktopAction> repaired(QList<VelUIDesktopAction> actions);

} // namespace ActionIds

} // namespace VelUI
