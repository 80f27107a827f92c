// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QToolButton>

namespace VelUI {

/// A button behind a field of a form. It is there while the field can be edited: where the field
/// hides its own button or is disabled, this one is so as well.
class ChooserButton : public QToolButton
{
    Q_OBJECT

public:
    /// A button that shows \a text, for \a field. Alt+Down in the field clicks it when \a takesKey.
    ChooserButton(const QString &text, QWidget *field, bool takesKey);

protected:
    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    bool takesKey(const QKeyEvent &event) const;
    void follow();

    QWidget *const m_field;
    QWidget *const m_fieldButton; // the field's own
};

} // namespace VelUI
