// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QMessageBox>
#include <QObject>
#include <QPointer>
#include <QString>
#include <QTimer>
#include <QVector>

#include <functional>

class QDialog;

/**
 * Drives the modal windows that open while it lives, in the order in which it was told.
 *
 * Every window that opens is matched with the next step: a message box is compared with the
 * announced title, text and buttons and then answered; any other dialog or pop-up is handed
 * to a function, and closed when a check fails in it. A window that no step waits for fails the
 * test and is closed.
 *
 * \code
 * ModalDriver modal;
 * modal.answer({QMessageBox::Warning, "Warning", "Can't start", QMessageBox::Ok}, QMessageBox::Ok);
 * view.slotExe();
 * QVERIFY(modal.finished());
 * \endcode
 */
class ModalDriver : public QObject
{
    Q_OBJECT

public:
    /// What a message box has to look like.
    struct Box
    {
        QMessageBox::Icon icon = QMessageBox::NoIcon;
        QString title;
        QString text;
        QMessageBox::StandardButtons buttons = QMessageBox::Ok;
        /// The default button; NoButton leaves it unchecked.
        QMessageBox::StandardButton defaultButton = QMessageBox::NoButton;
    };

    explicit ModalDriver(QObject *parent = nullptr);
    ~ModalDriver() override;

    /// The next window is the message box \a expected; presses \a button in it.
    void answer(const Box &expected, QMessageBox::StandardButton button);
    /// The next window is the message box \a expected; hands it to \a act, which ends it.
    void answerWith(const Box &expected, const std::function<void(QMessageBox *)> &act);
    /// The next modal dialog or pop-up menu is handed to \a act, which ends it.
    void handle(const std::function<void(QWidget *)> &act);

    /// Whether every announced window came and no other did.
    bool finished() const;

private:
    struct Step
    {
        bool isBox = false;
        Box box;
        std::function<void(QWidget *)> act;
    };

    void look();
    bool compare(const Box &expected, QWidget *window);

    QTimer m_timer;
    QVector<Step> m_steps;
    QVector<QPointer<QWidget>> m_handled;
    bool m_failed = false;
};
