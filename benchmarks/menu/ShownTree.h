// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QElapsedTimer>
#include <QObject>
#include <QTreeView>

#include <functional>

/**
 * A shown tree view of some model, and the waiting until it has settled: every row is there,
 * painted, and the models and the view have had nothing to do for a while.
 */
class ShownTree : public QTreeView
{
    Q_OBJECT

public:
    ShownTree();

    /// Runs the event loop until isComplete and 30 ms went by without a change or a painting.
    /// Returns the time in microseconds until the last of these, the wait not counted.
    double settle(const std::function<bool()> &isComplete);

    /// Runs the event loop until isReached.
    void settleUntil(const std::function<bool()> &isReached);

    /// The longest time in microseconds that the event loop did not turn while settling.
    double longestFreeze() const { return m_longestFreeze; }

    /// Starts the time.
    void start();
    void watch(const QAbstractItemModel *model);

protected:
    void paintEvent(QPaintEvent *event) override;

private:
    void touch();
    void turn();
    double now() const { return double(m_clock.nsecsElapsed()) / 1000; }

    QElapsedTimer m_clock;
    double m_lastChange = 0;
    double m_lastBusyTurn = 0;
    double m_lastTurn = 0;
    double m_longestFreeze = 0;
};
