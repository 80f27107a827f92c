// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QLabel>

class QAbstractItemView;

/**
 * Says, in the middle of a view, that nothing is there to be seen.
 */
class NoMatchLabel : public QLabel
{
    Q_OBJECT

public:
    /// A hidden label on \a view.
    explicit NoMatchLabel(QAbstractItemView *view);
    ~NoMatchLabel() override;

    /// Shows \a text, which a screen reader reads out, or nothing when that is empty.
    void say(const QString &text);

protected:
    bool eventFilter(QObject *watched, QEvent *event) override;
};
