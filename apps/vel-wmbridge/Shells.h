// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "SystemSignal.h"

#include <QObject>
#include <QString>

#include <map>
#include <string>

#include <sys/types.h>

/// The shells that run commands, each in a session of its own; they outlive the program.
class Shells : public QObject
{
    Q_OBJECT

public:
    explicit Shells(QObject *parent = nullptr);

    /**
     * Starts a shell.
     *
     * @param command what it runs
     * @param line the value of VEL_COMMAND there
     * @return whether it was started; ended() follows then
     */
    bool start(const QString &command, const std::string &line);

Q_SIGNALS:
    /// The shell for \a line has ended.
    void ended(const std::string &line);

private:
    void reap();

    SystemSignal m_childEnded;
    std::map<pid_t, std::string> m_running;
};
