// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "choosers/Choice.h"

#include <QCoreApplication>
#include <QStringList>
#include <QVector>

#include <optional>

class QWidget;

namespace VelUI {

/// Has a user choose categories of applications: first the main ones, then those that say more.
class CategoryChooser
{
    Q_DECLARE_TR_FUNCTIONS(VelUI::CategoryChooser)

public:
    /**
     * Shows the registered categories with those of \a current chosen, also unknown and deprecated ones.
     *
     * @return what the user chose; nothing when the choice was canceled or \a parent was deleted
     *         meanwhile
     */
    static std::optional<QStringList> choose(QWidget *parent, const QStringList &current);

    /// What is offered: name, category and remark of each. Deprecated ones only where they are chosen.
    static QVector<Choice> choices(const QStringList &current);
};

} // namespace VelUI
