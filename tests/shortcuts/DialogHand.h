// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QAbstractItemView>
#include <QElapsedTimer>
#include <QTest>
#include <QWidget>
#include <QWindow>

/**
 * The mouse and the keyboard on a window, without an X server: events take the way from the
 * platform on, so that focus, held buttons and modal windows are as under a hand.
 */
class DialogHand
{
public:
    explicit DialogHand(QWidget *dialog)
        : m_dialog(dialog)
    {
    }

    void click(const QWidget *widget, const QPoint &place) const
    {
        QTest::mouseClick(m_dialog->windowHandle(), Qt::LeftButton, Qt::NoModifier,
                          widget->mapTo(m_dialog, place));
    }
    void click(const QWidget *widget) const { click(widget, widget->rect().center()); }
    /// Clicks where a radio button has its circle and every line edit some room.
    void clickNearStart(const QWidget *widget) const { click(widget, QPoint(8, widget->height() / 2)); }
    void clickRow(QAbstractItemView *view, const QModelIndex &index) const
    {
        view->scrollTo(index);
        // The other columns may grow when a recording ends.
        const QRect rect = view->visualRect(index);
        click(view->viewport(), QPoint(rect.left() + 8, rect.center().y()));
    }

    /// Presses a key with its modifiers, as in Qt::CTRL | Qt::Key_J.
    void press(int key)
    {
        // One that is released and pressed within a millisecond counts as held.
        while (m_sinceKey.isValid() && m_sinceKey.elapsed() < 2)
            QTest::qSleep(1);
        QTest::keyClick(m_dialog->windowHandle(), Qt::Key(key & ~int(Qt::KeyboardModifierMask)),
                        Qt::KeyboardModifiers(key & int(Qt::KeyboardModifierMask)));
        m_sinceKey.start();
    }

private:
    QWidget *m_dialog;
    QElapsedTimer m_sinceKey;
};
