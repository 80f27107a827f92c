// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "DragOpening.h"

#include <frame/QtMajor.h>

#include <QDragMoveEvent>
#include <QTreeView>

namespace {

// Milliseconds.
constexpr int Patience = 700;

} // namespace

DragOpening::DragOpening(QTreeView *view)
    : m_view(view)
{
    m_timer.setSingleShot(true);
    m_timer.setInterval(Patience);
    connect(&m_timer, &QTimer::timeout, this, &DragOpening::open);
}

DragOpening::~DragOpening() = default;

void DragOpening::setOn(bool on)
{
    m_view->viewport()->removeEventFilter(this);
    rest(QModelIndex());
    if (on)
        m_view->viewport()->installEventFilter(this);
}

bool DragOpening::eventFilter(QObject *watched, QEvent *event)
{
    Q_UNUSED(watched)
    if (event->type() == QEvent::DragMove)
        rest(m_view->indexAt(QtMajor::positionOf(*static_cast<QDragMoveEvent *>(event)).toPoint()));
    else if (event->type() == QEvent::DragLeave || event->type() == QEvent::Drop)
        rest(QModelIndex());
    return false;
}

// A hand is never quite at rest: the same folder is no new one.
void DragOpening::rest(const QModelIndex &index)
{
    if (m_folder == index && index.isValid())
        return;
    m_folder = index;
    if (index.isValid())
        m_timer.start();
    else
        m_timer.stop();
}

void DragOpening::open()
{
    if (m_folder.isValid())
        m_view->expand(m_folder);
}
