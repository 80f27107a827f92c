// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ChoiceView.h"

#include <QAccessible>
#include <QHeaderView>
#include <QKeyEvent>
#include <QMouseEvent>
#include <QStyledItemDelegate>

namespace VelUI {

namespace {

bool hasBox(const QModelIndex &index)
{
    return index.siblingAtColumn(0).flags() & Qt::ItemIsUserCheckable;
}

void toggle(QAbstractItemModel *model, const QModelIndex &index)
{
    const QModelIndex box = index.siblingAtColumn(0);
    const bool isChecked = box.data(Qt::CheckStateRole).toInt() == Qt::Checked;
    model->setData(box, isChecked ? Qt::Unchecked : Qt::Checked, Qt::CheckStateRole);
}

/// Has the whole row behave as its box. The second click of a double click does not come here.
class RowDelegate : public QStyledItemDelegate
{
public:
    explicit RowDelegate(QObject *parent)
        : QStyledItemDelegate(parent)
    {
    }

    bool editorEvent(QEvent *event, QAbstractItemModel *model, const QStyleOptionViewItem &option,
                     const QModelIndex &index) override
    {
        if (!hasBox(index))
            return QStyledItemDelegate::editorEvent(event, model, option, index);
        if (event->type() != QEvent::MouseButtonRelease)
            return false;
        if (static_cast<QMouseEvent *>(event)->button() == Qt::LeftButton)
            toggle(model, index);
        return true;
    }
};

bool isForFilter(const QKeyEvent &event)
{
    if (event.modifiers() & (Qt::ControlModifier | Qt::AltModifier | Qt::MetaModifier))
        return false;
    return event.key() == Qt::Key_Backspace || (!event.text().isEmpty() && event.text().at(0).isPrint());
}

} // namespace

ChoiceView::ChoiceView(QWidget *parent)
    : QTreeView(parent)
{
    setItemDelegate(new RowDelegate(this));
    setRootIsDecorated(false);
    setItemsExpandable(false);
    setUniformRowHeights(true);
    setAllColumnsShowFocus(true);
    setAlternatingRowColors(true);
    setTabKeyNavigation(false);
    setEditTriggers(NoEditTriggers);
    header()->setSectionsMovable(false);
}

void ChoiceView::setModel(QAbstractItemModel *model)
{
    QTreeView::setModel(model);
    header()->setSectionResizeMode(QHeaderView::Stretch);
}

void ChoiceView::beginAtFirst()
{
    if (!currentIndex().isValid() && model()->rowCount() > 0)
        setCurrentIndex(model()->index(0, 0));
}

void ChoiceView::dataChanged(const QModelIndex &topLeft, const QModelIndex &bottomRight,
                             const QVector<int> &roles)
{
    QTreeView::dataChanged(topLeft, bottomRight, roles);
    if (topLeft == bottomRight && roles == QVector<int>{Qt::CheckStateRole})
        speakBox(topLeft);
}

// Qt tells screen readers that something changed, but not what.
void ChoiceView::speakBox(const QModelIndex &index)
{
    if (!QAccessible::isActive() || !isVisible())
        return;
    QAccessibleInterface *const view = QAccessible::queryAccessibleInterface(this);
    QAccessibleInterface *const cell =
        view ? view->tableInterface()->cellAt(index.row(), index.column()) : nullptr;
    if (!cell)
        return;
    QAccessible::State changed;
    changed.checked = true;
    QAccessibleStateChangeEvent event(cell, changed);
    QAccessible::updateAccessibility(&event);
}

bool ChoiceView::toggleCurrent()
{
    const QModelIndex current = currentIndex();
    if (!current.isValid() || !hasBox(current))
        return false;
    toggle(model(), current);
    return true;
}

void ChoiceView::keyPressEvent(QKeyEvent *event)
{
    if (event->key() == Qt::Key_Space && event->modifiers() == Qt::NoModifier && toggleCurrent())
        return;
    if (event->key() == Qt::Key_Up && currentIndex().row() <= 0)
        Q_EMIT leftUpward();
    else if (isForFilter(*event))
        Q_EMIT typed(event);
    else
        QTreeView::keyPressEvent(event);
}

} // namespace VelUI
