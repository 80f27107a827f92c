// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "SeveralRows.h"

#include "MenuSelection.h"

#include <QItemSelectionModel>
#include <QMouseEvent>
#include <QTreeView>

namespace {

bool liesIn(const QModelIndex &index, const QModelIndex &folder)
{
    QModelIndex above = index.parent();
    while (above.isValid() && above != folder)
        above = above.parent();
    return above.isValid();
}

} // namespace

SeveralRows::SeveralRows(QTreeView *view, MenuSelection &selection)
    : m_view(view)
    , m_selection(selection)
{
}

SeveralRows::~SeveralRows()
{
    if (m_isModeOurs)
        m_view->setSelectionMode(QAbstractItemView::SingleSelection);
}

void SeveralRows::setOn(bool on)
{
    if (on == m_isOn)
        return;
    m_isOn = on;
    if (on) {
        m_isModeOurs = m_view->selectionMode() == QAbstractItemView::SingleSelection;
        if (m_isModeOurs)
            m_view->setSelectionMode(QAbstractItemView::ExtendedSelection);
        m_view->viewport()->installEventFilter(this);
        connect(m_view, &QTreeView::collapsed, this, &SeveralRows::leaveFolder);
        return;
    }
    disconnect(m_view, nullptr, this, nullptr);
    m_view->viewport()->removeEventFilter(this);
    if (!m_isModeOurs)
        return;
    m_isModeOurs = false;
    m_view->setSelectionMode(QAbstractItemView::SingleSelection);
    if (m_selection.isSeveral())
        m_selection.show(m_selection.path());
}

// The second of two clicks that select or deselect means nothing else: it opens no folder, and edits
// nothing that is selected elsewhere.
bool SeveralRows::eventFilter(QObject *watched, QEvent *event)
{
    Q_UNUSED(watched)
    return event->type() == QEvent::MouseButtonDblClick
        && (static_cast<QMouseEvent *>(event)->modifiers() & (Qt::ControlModifier | Qt::ShiftModifier));
}

// Nobody would see what is about to be deleted. Where nothing else is selected, the folder takes the
// place of what it holds.
void SeveralRows::leaveFolder(const QModelIndex &folder)
{
    const bool wasAny = m_view->selectionModel()->hasSelection();
    const bool isCurrentGone = liesIn(m_view->currentIndex(), folder);
    m_selection.deselect([&](const QModelIndex &index) { return liesIn(index, folder); });
    if (wasAny && !m_view->selectionModel()->hasSelection())
        m_selection.select(folder);
    else if (isCurrentGone)
        m_view->selectionModel()->setCurrentIndex(folder, QItemSelectionModel::NoUpdate);
}
