// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QAccessibleWidget>

class VelRadioGroupBox;

/// Presents a VelRadioGroupBox to assistive programs as a radio button that has children.
class RadioGroupBoxAccessible : public QAccessibleWidget
{
public:
    /// \a box outlives the interface: Qt deletes the interface with the widget.
    explicit RadioGroupBoxAccessible(VelRadioGroupBox *box);

    /// Makes Qt create this interface for every VelRadioGroupBox; further calls do nothing.
    static void install();

    QString text(QAccessible::Text kind) const override;
    QAccessible::State state() const override;
    QStringList actionNames() const override;
    void doAction(const QString &actionName) override;

private:
    VelRadioGroupBox *box() const;
};
