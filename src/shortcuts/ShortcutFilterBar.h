// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "PressedKeys.h"
#include "ShortcutFilter.h"

#include <QWidget>

class QLineEdit;
class QPushButton;

/**
 * The line in which a user tells which shortcuts to show.
 *
 * While "Press keys" is on, the keys that are pressed in the field are looked for instead of a text.
 */
class ShortcutFilterBar : public QWidget
{
    Q_OBJECT

public:
    explicit ShortcutFilterBar(QWidget *parent);
    ~ShortcutFilterBar() override;

    /// What the user asks for.
    ShortcutFilter filter() const;
    /// Goes one step back to no filter; false when there is none.
    bool stepBack();

    QLineEdit *filterEdit() const { return m_edit; }
    /// Adds another button to the end of the line.
    void addButton(QPushButton *button);

Q_SIGNALS:
    /// The user asks for something else.
    void filterChanged();
    /// The user is about to ask for something.
    void entered();
    /// The user wants to go on to what is shown.
    void left();

protected:
    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    QPushButton *makeButton(const char *name, const QString &text);
    void connectParts();
    void goToField();
    void setPressingKeys(bool isOn);
    bool watchKeys(const QEvent &event);
    bool watchPressedKey(QEvent *event);

    QLineEdit *const m_edit;
    QPushButton *m_pressKeysButton = nullptr;
    QPushButton *m_changedOnlyButton = nullptr;
    PressedKeys m_pressed;
    QString m_text; // of the field, while keys are pressed there
};
