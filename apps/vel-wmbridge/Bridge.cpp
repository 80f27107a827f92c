// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "Bridge.h"

#include <QProcess>
#include <QProcessEnvironment>
#include <QSocketNotifier>

Bridge::Bridge(const BridgeCommands &commands, QObject *parent)
    : QObject(parent)
    , m_commands(commands)
    , m_receiver([this](const std::string &line) { obey(line); })
{
    m_receiver.setLostHandler([this] { Q_EMIT lost(); });
}

bool Bridge::start(bool replace)
{
    if (!m_receiver.acquire(replace))
        return false;
    auto *notifier = new QSocketNotifier(m_receiver.connectionFd(), QSocketNotifier::Read, this);
    connect(notifier, &QSocketNotifier::activated, this, [this] { m_receiver.processEvents(); });
    return true;
}

void Bridge::stop()
{
    m_receiver.release();
}

void Bridge::obey(const std::string &line)
{
    QString command = m_commands.other;
    if (line == "VELWM_UPDATE_STARTMENU")
        command = m_commands.startMenu;
    else if (line == "VELWM_UPDATE_TOOLBAR")
        command = m_commands.toolBar;
    else if (line == "VELWM_UPDATE_SHORTCUT")
        command = m_commands.shortcut;
    if (command.isEmpty())
        return;

    QProcess shell;
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    environment.insert(QStringLiteral("VEL_COMMAND"), QString::fromLocal8Bit(line.c_str()));
    shell.setProcessEnvironment(environment);
    shell.setProgram(QStringLiteral("/bin/sh"));
    shell.setArguments({QStringLiteral("-c"), command});
    if (!shell.startDetached())
        Q_EMIT failed(QString::fromLocal8Bit(line.c_str()));
}
