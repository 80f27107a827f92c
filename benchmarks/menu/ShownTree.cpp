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
    QCoreApplication::processEvents(QEventLoop::AllEvents, 1);
    const double time = now();
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
    } while (now() - m_lastChange < Quiet || !isComplete());
    return m_lastChange;
}
