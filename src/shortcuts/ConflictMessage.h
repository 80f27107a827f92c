// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QKeySequence>
#include <QObject>
#include <QString>
#include <QTimer>

class QDialog;
struct ShortcutConflict;

/**
 * The message that a key is refused, from the refusal until it is shown.
 */
class ConflictMessage : public QObject
{
    Q_OBJECT

public:
    /// Belongs over \a dialog, which may go while a message is shown.
    explicit ConflictMessage(QDialog *dialog);
    ~ConflictMessage() override;

    /// A key is refused because of \a conflict.
    void refuse(const QKeySequence &key, const ShortcutConflict &conflict);
    /// Forgets the refusal.
    void clear();

    /**
     * Shows the message unless a button of the mouse is held; then it follows when that is up.
     *
     * @return whether there was nothing to tell; if there was, the dialog may have gone, and this
     *         object with it
     */
    bool show();
    /// Shows the message when the mouse is up.
    void showLater();

Q_SIGNALS:
    /// The user has read the message.
    void closed();

private:
    QDialog *const m_dialog;
    QString m_text;
    QTimer m_timer;
};
