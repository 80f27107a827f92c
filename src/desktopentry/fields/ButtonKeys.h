// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QHash>
#include <QObject>

class QAbstractButton;
class QKeyEvent;
class QWidget;

namespace VelUI {

/// Presses the buttons beside a widget when the widget gets their keys.
///
/// A key whose button is hidden or disabled is the widget's own. A held key presses no button again.
class ButtonKeys : public QObject
{
public:
    /// Watches \a widget, which owns this object.
    explicit ButtonKeys(QWidget *widget);

    /// Presses \a button when the key is pressed without modifiers.
    void add(Qt::Key key, QAbstractButton *button);
    /// Presses \a button when something is typed.
    void addTyping(QAbstractButton *button);

    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    QAbstractButton *buttonFor(const QKeyEvent &event) const;

    QHash<int, QAbstractButton *> m_buttons;
    QAbstractButton *m_typing = nullptr;
};

} // namespace VelUI
