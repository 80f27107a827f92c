// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ShownTree.h"

#include <QAbstractItemModel>
#include <QCoreApplication>

#include <algorithm>

namespace {

constexpr double Quiet = 30000;
constexpr double GiveUp = 60e6;

} // namespace

ShownTree::ShownTree()
{
    setHeaderHidden(true);
    setUniformRowHeights(true);
    resize(400, 700);
}

void ShownTree::start()
{
    m_clock.start();
}

void ShownTree::watch(const QAbstractItemModel *model)
{
    connect(model, &QAbstractItemModel::rowsInserted, this, &ShownTree::touch);
    connect(model, &QAbstractItemModel::rowsRemoved, this, &ShownTree::touch);
    connect(model, &QAbstractItemModel::dataChanged, this, &ShownTree::touch);
    connect(model, &QAbstractItemModel::layoutChanged, this, &ShownTree::touch);
    connect(model, &QAbstractItemModel::modelReset, this, &ShownTree::touch);
}

void ShownTree::touch()
{
    m_lastChange = now();
}

void ShownTree::paintEvent(QPaintEvent *event)
{
    QTreeView::paintEvent(event);
    touch();
}

void ShownTree::turn()
{
    const double lastChange = m_lastChange;
    QCoreApplication::processEvents(QEventLoop::AllEvents, 1);
    const double time = now();
    if (m_lastChange > lastChange)
        m_lastBusyTurn = time;
    m_longestFreeze = std::max(m_longestFreeze, time - m_lastTurn);
    m_lastTurn = time;
    if (time > GiveUp)
        qFatal("the tree does not settle");
}

void ShownTree::settleUntil(const std::function<bool()> &isReached)
{
    while (!isReached())
        turn();
}

double ShownTree::settle(const std::function<bool()> &isComplete)
{
    do {
        turn();
        // What a change has set going may wait for the next turn: quiet begins behind its own.
    } while (now() - m_lastBusyTurn < Quiet || !isComplete());
    return m_lastChange;
}
