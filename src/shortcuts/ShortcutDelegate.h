// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QPersistentModelIndex>
#include <QStyledItemDelegate>

class IShortcutObject;
class QAbstractItemView;

/**
 * Shows the rows of a ShortcutsModel with all keys of an action, changed ones in bold with a mark
 * and a button that takes the change back.
 *
 * Names that are cut short are told in full by a tool tip.
 */
class ShortcutDelegate : public QStyledItemDelegate
{
    Q_OBJECT

public:
    /// Paints for \a view, which outlives it or owns it.
    explicit ShortcutDelegate(QAbstractItemView *view);
    ~ShortcutDelegate() override;

    QSize sizeHint(const QStyleOptionViewItem &option, const QModelIndex &index) const override;
    void paint(QPainter *painter, const QStyleOptionViewItem &option,
               const QModelIndex &index) const override;
    bool helpEvent(QHelpEvent *event, QAbstractItemView *view, const QStyleOptionViewItem &option,
                   const QModelIndex &index) override;

Q_SIGNALS:
    /// The button of a row was clicked.
    void resetRequested(const QModelIndex &index);

protected:
    void initStyleOption(QStyleOptionViewItem *option, const QModelIndex &index) const override;
    bool editorEvent(QEvent *event, QAbstractItemModel *model, const QStyleOptionViewItem &option,
                     const QModelIndex &index) override;

private:
    QRect buttonRect(const QStyleOptionViewItem &option, const QModelIndex &index) const;
    QString toolTip(QPoint position, const QStyleOptionViewItem &option, const QModelIndex &index) const;

    QAbstractItemView *const m_view;
    QPersistentModelIndex m_pressed; // its button is
};
