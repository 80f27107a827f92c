// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QGridLayout>

namespace VelUI {

/// Two columns of labels and fields whose rows can be hidden.
///
/// A label becomes the buddy of its field, and the field is announced by the label's text;
/// in a field of several parts every part is.
class FormLayout : public QGridLayout
{
    Q_OBJECT

public:
    explicit FormLayout(QWidget *parent = nullptr);

    /// Appends a row; \a label is the bare word, the layout adds the colon. Returns the row.
    int addRow(const QString &label, QWidget *field);
    int addRow(const QString &label, QLayout *field);
    /// Appends a row of two widgets; \a left is taken for the label when it is a button.
    int addRow(QWidget *left, QWidget *right);
    /// Appends a row of one widget across both columns.
    int addRow(QWidget *field);

    void setRowVisible(int row, bool visible);
    void hideRow(int row);
    void showRow(int row);
    void setRowLabelBold(int row);
};

} // namespace VelUI
