// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QFileSystemWatcher>
#include <QObject>
#include <QString>

#include <utility>

/**
 * Notices that a directory came to be, that it went, or that another came to stand in its place.
 *
 * A file-system model does not: it watches what stood there when it was made, and nothing above.
 */
class RootWatch : public QObject
{
    Q_OBJECT

public:
    /// Watches for \a directory, which may be missing with any of those above it.
    explicit RootWatch(const QString &directory);
    ~RootWatch() override;

    /// What stands there now is known; replaced() is for what comes next.
    void begin();

Q_SIGNALS:
    /// There is another directory now than before, or none.
    void replaced();

private:
    // Device and inode, which another directory does not have; zeros for none.
    using Identity = std::pair<quint64, quint64>;

    Identity identity() const;
    void look();
    void watchAbove();

    const QString m_directory;
    QFileSystemWatcher m_watcher;
    Identity m_known;
};
