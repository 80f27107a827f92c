// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "Shells.h"

#include <csignal>
#include <cstring>
#include <vector>

#include <spawn.h>
#include <sys/wait.h>
#include <unistd.h>

namespace {

constexpr char variable[] = "VEL_COMMAND=";

// This program's environment with \a assignment in the place of the variable that it sets.
std::vector<char *> environmentWith(std::string &assignment)
{
    std::vector<char *> result;
    for (char **entry = environ; entry && *entry; ++entry) {
        if (std::strncmp(*entry, variable, sizeof variable - 1) != 0)
            result.push_back(*entry);
    }
    result.push_back(assignment.data());
    result.push_back(nullptr);
    return result;
}

// The id of the new process; 0 when there is none.
pid_t spawn(std::string command, std::string assignment)
{
    char shell[] = "/bin/sh";
    char option[] = "-c";
    char *const arguments[] = {shell, option, command.data(), nullptr};
    std::vector<char *> environment = environmentWith(assignment);
    posix_spawnattr_t attributes;
    if (posix_spawnattr_init(&attributes) != 0)
        return 0;
    pid_t process = 0;
    const bool isStarted = posix_spawnattr_setflags(&attributes, POSIX_SPAWN_SETSID) == 0
        && posix_spawn(&process, shell, nullptr, &attributes, arguments, environment.data()) == 0;
    posix_spawnattr_destroy(&attributes);
    return isStarted ? process : 0;
}

} // namespace

Shells::Shells(QObject *parent)
    : QObject(parent)
    , m_childEnded({SIGCHLD})
{
    connect(&m_childEnded, &SystemSignal::caught, this, &Shells::reap);
}

bool Shells::start(const QString &command, const std::string &line)
{
    const pid_t process = spawn(command.toLocal8Bit().toStdString(), variable + line);
    if (process == 0)
        return false;
    m_running.emplace(process, line);
    return true;
}

void Shells::reap()
{
    std::vector<std::string> lines;
    for (auto shell = m_running.begin(); shell != m_running.end();) {
        int status = 0;
        if (waitpid(shell->first, &status, WNOHANG) == 0) {
            ++shell;
        } else {
            lines.push_back(shell->second);
            shell = m_running.erase(shell);
        }
    }
    for (const std::string &line : lines)
        Q_EMIT ended(line);
}
