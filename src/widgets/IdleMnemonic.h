// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>

class QEvent;
class QGroupBox;

/**
 * Gives the letter that the title of a group box underlines back to other widgets.
 *
 * A group box grabs it as a shortcut with every title. Where the box has no use for it, a widget
 * with the same letter would not be reached by it either.
 */
class IdleMnemonic
{
public:
    /// Serves \a box, which outlives it and has just been constructed.
    explicit IdleMnemonic(QGroupBox *box);

    /// Looks after a title that changed; \a event is one of the box.
    void watch(const QEvent &event);

private:
    void release(int shortcuts);

    QGroupBox *const m_box;
    QString m_title; // as it was when its letter was given back
    int m_lastId = 0;
};
