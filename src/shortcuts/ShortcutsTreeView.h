// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "HiddenRows.h"
#include "RowsListening.h"
#include "ShortcutFilter.h"
#include "ShortcutIndex.h"

#include <QKeySequence>
#include <QPersistentModelIndex>
#include <QTimer>
#include <QTreeView>
#include <QVector>

#include <functional>
#include <memory>

class ShortcutsModel;

/**
 * The groups and shortcuts of a ShortcutsModel; tells which one is current and with which keys.
 *
 * Rows whose shortcut is gone are hidden, and groups of such rows alone. A group that is registered
 * later comes open. With a model of another kind it is a plain tree.
 *
 * A filter hides further rows. When it hides the current one, nothing is current until that row is
 * seen again. A row that no longer matches because its key changed stays while it is current.
 */
class ShortcutsTreeView : public QTreeView
{
    Q_OBJECT

public:
    explicit ShortcutsTreeView(QWidget *parent = nullptr);
    ~ShortcutsTreeView() override;

    /// Shows \a model, which is not owned.
    void setModel(QAbstractItemModel *model) override;

    /// Whether the current item is a shortcut.
    bool isShortcutCurrent() const;
    /// The pending key of the current item; empty when that is no shortcut.
    QKeySequence currentKeySequence() const;

    /// Opens all groups. Unlike expandAll() it does not have the view remember every single shortcut.
    void openAllGroups();

    /// Makes a shortcut current and seen, whatever the filter hides.
    void goTo(const QModelIndex &row);

    /// Hears how many shortcuts a filter lets be seen.
    using Count = std::function<void(int)>;

    /// Shows those shortcuts alone that \a filter matches, in groups that are open; \a tell is called
    /// now, and whenever their number may have changed.
    void setFilter(const ShortcutFilter &filter, const Count &tell = {});
    /// Does bit by bit what takes time when the first filter is set.
    void prepareFilter();
    /// Makes the first shortcut that is seen current, unless one is current.
    void selectFirstShortcut();

public Q_SLOTS:
    /// Sets the pending key of the current item.
    void setKeySequence(QKeySequence key);

Q_SIGNALS:
    /// A shortcut became current, or the current one's key changed.
    void currentShortcutChanged(QKeySequence defaultKS, QKeySequence currentKS);
    /// A group, or nothing, became current.
    void currentItemIsNotShortcut();

protected:
    void currentChanged(const QModelIndex &current, const QModelIndex &previous) override;
    void dataChanged(const QModelIndex &topLeft, const QModelIndex &bottomRight,
                     const QVector<int> &roles = QVector<int>()) override;
    /// The width of all items, hidden ones and those of closed groups left out.
    int sizeHintForColumn(int column) const override;
    /// Shortcuts are drawn as the open rows that expandAll() makes of them: icons in their state On.
    void drawRow(QPainter *painter, const QStyleOptionViewItem &option,
                 const QModelIndex &index) const override;
    bool eventFilter(QObject *watched, QEvent *event) override;

private:
    ShortcutsModel *shortcutsModel() const;
    void prepareSome();
    void refreshRowsLater();
    void refreshRows();
    void hideRows(const ShortcutsModel &shortcuts, const QModelIndex &keptRow);
    void leaveHiddenRow();
    void openGroups(const ShortcutsModel &shortcuts);
    void closeGroups();
    QVector<QModelIndex> widestItems(const ShortcutsModel &shortcuts, int column) const;
    int indentationOf(const QModelIndex &index) const;

    std::unique_ptr<RowsListening> m_rowsListening;
    HiddenRows m_hidden{this};
    ShortcutFilter m_filter;
    Count m_tellCount;
    ShortcutIndex m_index;
    QTimer m_preparing;
    QPersistentModelIndex m_leftRow; // was current until it was hidden
    QVector<QPersistentModelIndex> m_closedGroups; // those that a filter opened
    int m_groups = 0; // those that were there at the last look; later ones come open
    bool m_isRefreshPending = false;
};
