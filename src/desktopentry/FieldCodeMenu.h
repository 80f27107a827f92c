// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QMenu>

class QLineEdit;

namespace VelUI {

/// A menu of the field codes of a command, each explained; one that is chosen is typed into a line.
class FieldCodeMenu : public QMenu
{
    Q_OBJECT

public:
    /// Types at the cursor of \a line.
    FieldCodeMenu(QLineEdit *line, QWidget *parent);

private:
    void insert(const QString &code);

    QLineEdit *const m_line;
};

} // namespace VelUI
