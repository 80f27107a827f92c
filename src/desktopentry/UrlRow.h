// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "FormRow.h"
#include "KeptValue.h"
#include "PropsRow.h"

#include <QCoreApplication>

class QLineEdit;
class QToolButton;

namespace VelUI {

/// The row of a Link's address, with a button that asks for information about the address.
class UrlRow : public PropsRow
{
    Q_DECLARE_TR_FUNCTIONS(VelDesktopEntryPropsWidgetPrivate)

public:
    /// Appends the row to \a layout.
    explicit UrlRow(FormLayout *layout);

    QString url() const;
    /// The button; hidden until it is wanted.
    QToolButton *infoButton() const;
    /// Shows the button whenever the row is shown, or never.
    void setInfoButtonWanted(bool wanted);
    bool isInfoButtonWanted() const { return m_isInfoButtonWanted; }
    FormRow row() const;

    void setVisible(bool visible) override;
    void load(const VelUIDesktopEntry &entry) override;
    void save(VelUIDesktopEntry *entry) const override;
    void putAway() override;
    void restore() override;
    void forget() override;

private:
    struct Field
    {
        QLineEdit *line;
        QToolButton *button;
        int number;
    };

    UrlRow(FormLayout *layout, const Field &field);
    static Field makeRow(FormLayout *layout);

    const int m_number;
    QLineEdit *const m_line;
    QToolButton *const m_infoButton;
    bool m_isInfoButtonWanted = false;
    bool m_isVisible = true;
    KeptValue<QLineEdit> m_kept;
};

} // namespace VelUI
