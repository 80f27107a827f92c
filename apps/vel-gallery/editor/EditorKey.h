// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <IShortcutObject.h>

#include <QPointer>

#include <functional>

class QPlainTextEdit;

/**
 * A key that a text editor itself looks for, with neither an action nor a shortcut behind it.
 *
 * It shows how an application gives the keys that it handles in its own way to the user's choice.
 */
class EditorKey : public IShortcutObject
{
    Q_OBJECT

public:
    /// What the key stands for.
    struct Command
    {
        QString name; ///< the name under which the key is saved
        QString group;
        QString text;
        QKeySequence key; ///< the default key
        std::function<void(QPlainTextEdit *)> run;
    };

    /// Lets \a editor, which is not owned, obey \a command; its default key is in force at first.
    EditorKey(QPlainTextEdit *editor, const Command &command);
    ~EditorKey() override;

    QKeySequence objectKeySequence() const override;
    void setObjectKeySequence(const QKeySequence &key) override;
    void setKeySequence(const QKeySequence &key) override;
    void reset() override;
    QKeySequence keySequence() const override;
    void apply() override;
    QString group() const override;
    QString text() const override;
    QIcon icon() const override;

    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    const QPointer<QPlainTextEdit> m_editor;
    const Command m_command;
    QKeySequence m_keyInForce;
};
