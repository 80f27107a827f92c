// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QWidget>

class QLabel;
class QPushButton;

namespace VelUI {

/// What the dialog of a list has to say about its items, with a button that repairs it.
class ListMessage : public QWidget
{
    Q_OBJECT

public:
    explicit ListMessage(QWidget *parent = nullptr);

    /// Shows \a text, and the button where \a repair says what it does.
    void tell(const QString &text, const QString &repair);
    /// Leads whoever overlooked the message to it.
    void insist();

    /// \a text as it goes into a sentence: its middle is left out where it is long.
    static QString shortened(const QString &text);

Q_SIGNALS:
    /// The user pressed the button.
    void repairWanted();

private:
    QLabel *m_icon;
    QLabel *m_text;
    QPushButton *m_repair;
};

} // namespace VelUI
