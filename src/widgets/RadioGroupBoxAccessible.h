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

    /**
     * Makes sure that \a box, which is being constructed, is presented by this class.
     *
     * The first call installs the factory. An interface that Qt has made already, while it
     * constructed the base class, is replaced.
     */
    static void install(VelRadioGroupBox *box);

    QString text(QAccessible::Text kind) const override;
    QAccessible::State state() const override;
    QStringList actionNames() const override;
    void doAction(const QString &actionName) override;

private:
    VelRadioGroupBox *box() const;
};
