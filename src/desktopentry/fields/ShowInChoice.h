// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QRadioButton>
#include <QStringList>

namespace VelUI {

class StringListEdit;

/// A radio button that heads a row: Tab reaches it whether or not it is the checked one.
class RowRadioButton : public QRadioButton
{
    Q_OBJECT

public:
    explicit RowRadioButton(const QString &text, QWidget *parent = nullptr);

protected:
    void focusInEvent(QFocusEvent *event) override;
};

/// The choice between "Only show in" and "Not show in", each with a list of its own.
struct ShowInChoice
{
    QRadioButton *onlyButton;
    StringListEdit *onlyList;
    QRadioButton *notButton;
    StringListEdit *notList;

    /// Makes the buttons exclude each other and enable their lists, "Only show in" first.
    void connectUp(QObject *owner) const;
    /// Fills both lists and chooses "Not show in" when its list holds something.
    void load(const QStringList &only, const QStringList &no) const;
};

} // namespace VelUI
