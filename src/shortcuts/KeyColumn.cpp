// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "KeyColumn.h"

#include <QEvent>
#include <QHeaderView>
#include <QTreeView>

KeyColumn::KeyColumn(QTreeView *view)
    : m_view(view)
    , m_plainWidth(view->header()->sectionSize(0))
{
    m_view->header()->setStretchLastSection(false);
    m_view->setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    m_view->viewport()->installEventFilter(this);
    connect(m_view->header(), &QHeaderView::sectionResized, this,
            [this](int column, int, int width) { takeIn(column, width); });
    m_measuring.setSingleShot(true);
    m_measuring.setInterval(0);
    connect(&m_measuring, &QTimer::timeout, this, &KeyColumn::measure);
    if (m_view->model())
        connect(m_view->model(), &QAbstractItemModel::dataChanged, this, &KeyColumn::follow);
    measure();
}

KeyColumn::~KeyColumn()
{
    m_view->setHorizontalScrollBarPolicy(Qt::ScrollBarAsNeeded);
    m_view->header()->setStretchLastSection(true);
    m_isArranging = true;
    m_view->header()->resizeSection(0, m_plainWidth);
}

void KeyColumn::setChosenWidth(int width)
{
    m_chosenWidth = qMax(0, width);
    arrange();
}

// The user moved a border, of either column.
void KeyColumn::takeIn(int column, int width)
{
    if (m_isArranging || column > 1)
        return;
    const int names = column == 0 ? width : m_view->viewport()->width() - width;
    setChosenWidth(qMax(m_view->header()->minimumSectionSize(), m_view->viewport()->width() - names));
}

void KeyColumn::follow(const QModelIndex &topLeft, const QModelIndex &bottomRight)
{
    const QAbstractItemView *view = m_view;
    if (topLeft != bottomRight)
        m_measuring.start();
    else if (view->sizeHintForIndex(topLeft).width() > m_contentsWidth)
        show(view->sizeHintForIndex(topLeft).width());
}

void KeyColumn::measure()
{
    const QAbstractItemView *view = m_view;
    show(qMax(view->sizeHintForColumn(1), m_view->header()->sectionSizeHint(1)));
}

void KeyColumn::show(int contentsWidth)
{
    m_contentsWidth = contentsWidth;
    arrange();
}

void KeyColumn::arrange()
{
    const int width = m_view->viewport()->width();
    const int wanted = m_chosenWidth > 0 ? m_chosenWidth : m_contentsWidth;
    // Names are seen, too.
    const int keys = qMin(wanted, width * 2 / 3);
    m_isArranging = true;
    m_view->header()->resizeSection(0, width - keys);
    m_view->header()->resizeSection(1, keys);
    m_isArranging = false;
}

bool KeyColumn::eventFilter(QObject *watched, QEvent *event)
{
    if (watched == m_view->viewport() && event->type() == QEvent::Resize)
        arrange();
    return QObject::eventFilter(watched, event);
}
