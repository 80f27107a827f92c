// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QWidget>

class KIconButton;
class QLineEdit;

namespace VelUI {

/// A field for an icon's name, with a button that shows the icon and lets the user choose one.
///
/// Typing changes the name only; the button follows setIcon() and the user's choice.
class IconEdit : public QWidget
{
    Q_OBJECT

public:
    explicit IconEdit(QWidget *parent = nullptr);

    /// Sets the name and the icon on the button; emits nothing.
    void setIcon(const QString &icon);
    QString icon() const;
    /// Disables the button; the line for the name stays as it is.
    void setReadOnly(bool readOnly);

public Q_SLOTS:
    void slotIconChanged(const QString &newIcon);

Q_SIGNALS:
    /// Emitted when the user chose an icon with the button.
    void iconChanged(const QString &icon);

private:
    QLineEdit *m_lineEdit;
    KIconButton *m_button;
};

/// The value of the field as a row of a form reads and writes it.
QString fieldValue(const IconEdit *field);
void setFieldValue(IconEdit *field, const QString &value);

} // namespace VelUI
