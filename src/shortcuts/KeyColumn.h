// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QObject>
#include <QTimer>

class QModelIndex;
class QTreeView;

/**
 * Keeps the second column of a tree, that of the keys, in view; the names get what it leaves.
 *
 * It is as wide as its contents until the user moves the border in the header.
 */
class KeyColumn : public QObject
{
    Q_OBJECT

public:
    /// Arranges the columns of \a view until it is destroyed; then they are as before.
    explicit KeyColumn(QTreeView *view);
    ~KeyColumn() override;

    /// The width that the user chose; 0 while it follows the contents.
    int chosenWidth() const { return m_chosenWidth; }
    void setChosenWidth(int width);

protected:
    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    void takeIn(int column, int width);
    void follow(const QModelIndex &topLeft, const QModelIndex &bottomRight);
    void measure();
    void show(int contentsWidth);
    void arrange();

    QTreeView *const m_view;
    const int m_plainWidth; // of the names, without this
    QTimer m_measuring; // once for many keys that change together
    int m_chosenWidth = 0;
    int m_contentsWidth = 0;
    bool m_isArranging = false;
};
