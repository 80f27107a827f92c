// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QElapsedTimer>
#include <QObject>
#include <QPointer>
#include <QString>

#include <memory>

class QProgressDialog;
class QWidget;
class WaitCursor;

/**
 * Lets the user see and end what takes long on the thread of the windows.
 *
 * While it lives, what the user does has to wait. After half a second a small window tells what
 * goes on; from then on Escape, its button or closing a window ends it, and all else that the user
 * does is dropped.
 */
class LongWork : public QObject
{
    Q_OBJECT

public:
    enum class End {
        ByUser, ///< as said above
        ByItself ///< only when the work is done
    };

    /// For work that begins now, on behalf of \a owner, which may go away meanwhile. \a title is
    /// that of the window, \a text says in plain text what goes on.
    LongWork(QWidget *owner, const QString &title, const QString &text, End end = End::ByUser);
    ~LongWork() override;

    /**
     * Has events handled; to be called every few milliseconds, more often than is worth it does
     * not matter.
     *
     * @return whether to go on: false once the user has ended it, or \a owner went away
     */
    bool goOn();

    /// Shows that \a done of \a expected pieces are done; of none it is shown that work goes on.
    void setProgress(int done, int expected);

    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    void showWindow();
    void showProgress();
    bool isOwnWindow(const QObject *object) const;
    void endByUser() { m_isEnded = m_isEnded || m_end == End::ByUser; }

    const QPointer<QWidget> m_owner;
    const QString m_title;
    const QString m_text;
    const End m_end;
    QElapsedTimer m_sinceBegun;
    QElapsedTimer m_sinceEvents;
    std::unique_ptr<WaitCursor> m_cursor;
    QPointer<QProgressDialog> m_window;
    bool m_isEnded = false;
    int m_done = 0;
    int m_expected = 0;
};
