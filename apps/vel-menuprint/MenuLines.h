// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>
#include <QVector>

struct MenuItem;

/// A menu as a list of lines, one for each thing that can be started, for launchers that show lines.
namespace MenuLines {

struct Line
{
    QString text; ///< "Folder > Name", on one line and different from all others
    QString path; ///< of what it starts
    QString icon; ///< as the menu has it
};

/**
 * The lines of \a menu in the order of the menu. Of two that would be the same the later one has a
 * number behind it: "Name (2)".
 */
QVector<Line> of(const MenuItem &menu);

} // namespace MenuLines
