// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QObject>
#include <QPersistentModelIndex>
#include <QTimer>

class QTreeView;

/**
 * Opens the folder over which a drag rests. Unlike what the base class of the view can do by itself,
 * it never closes one.
 */
class DragOpening : public QObject
{
    Q_OBJECT

public:
    /// For the folders of \a view. Off at first.
    explicit DragOpening(QTreeView *view);
    ~DragOpening() override;

    void setOn(bool on);

    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    void rest(const QModelIndex &index);
    void open();

    QTreeView *const m_view;
    QPersistentModelIndex m_folder;
    QTimer m_timer;
};
