// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QElapsedTimer>
#include <QObject>
#include <QPersistentModelIndex>
#include <QString>
#include <QTimer>

class QAbstractItemView;

/**
 * A tool tip at an item of a view that stays long enough to be read.
 *
 * Qt hides tool tips whenever a window is activated, which follows every dialog that closes, and
 * the view itself when the pointer rests above an item without a tip. This one waits for the
 * window of the view to be active, comes again if it was hidden in its first moment, and is not
 * replaced by the empty tip of an item.
 */
class ReadableTip : public QObject
{
    Q_OBJECT

public:
    /// The \a view is to outlive this object, or to be its last user.
    explicit ReadableTip(QAbstractItemView *view);
    ~ReadableTip() override;

    /// Shows \a text as it is written, at the item \a at of the view or else in its middle.
    void show(const QString &text, const QModelIndex &at);

    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    void look();
    void showNow();
    bool isShown() const;

    QAbstractItemView *const m_view;
    QString m_text;
    QPersistentModelIndex m_item;
    QTimer m_timer;
    QElapsedTimer m_sinceAsked;
};
