// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QWidget>

class QLineEdit;
class QToolButton;

namespace VelUI {

/// A field for a command or a path, with a button that looks for a file.
class PathEdit : public QWidget
{
    Q_OBJECT

public:
    explicit PathEdit(QWidget *parent = nullptr);

    QString text() const;
    void setReadOnly(bool readOnly);

public Q_SLOTS:
    void clear();
    void setText(const QString &text);
    void selectPathButtonClicked();

Q_SIGNALS:
    /// Emitted whenever the text changes, by whomever.
    void changed();

private:
    QLineEdit *m_lineEdit;
    QToolButton *m_button;
};

/// The value of the field as a row of a form reads and writes it.
QString fieldValue(const PathEdit *field);
void setFieldValue(PathEdit *field, const QString &value);

} // namespace VelUI
