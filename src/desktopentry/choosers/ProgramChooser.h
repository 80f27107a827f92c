// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QCoreApplication>
#include <QString>

class QWidget;

namespace VelUI {

/// Has a user choose one of the programs that are installed.
class ProgramChooser
{
    Q_DECLARE_TR_FUNCTIONS(VelUI::ProgramChooser)

public:
    /**
     * Shows the programs that the folders of PATH hold.
     *
     * @return the name of the program, not quoted; empty when the choice was canceled or \a parent was
     *         deleted meanwhile
     */
    static QString choose(QWidget *parent);
};

} // namespace VelUI
