// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "Bridge.h"

#include <QSocketNotifier>

namespace {

constexpr char StartMenuLine[] = "VELWM_UPDATE_STARTMENU";

} // namespace

Bridge::Bridge(const BridgeCommands &commands, QObject *parent)
    : QObject(parent)
    , m_commands(commands)
    , m_receiver([this](const std::string &line) { obey(line); })
{
    m_receiver.setLostHandler([this] { Q_EMIT lost(); });
    connect(&m_shells, &Shells::ended, this, [this](const std::string &line) {
        m_queue.end(line);
        startWaiting();
    });
}

bool Bridge::start(bool replace)
{
    if (!m_receiver.acquire(replace))
        return false;
    auto *notifier = new QSocketNotifier(m_receiver.connectionFd(), QSocketNotifier::Read, this);
    connect(notifier, &QSocketNotifier::activated, this, [this] { m_receiver.processEvents(); });
    return true;
}

void Bridge::updateStartMenu()
{
    obey(StartMenuLine);
}

void Bridge::stop()
{
    m_receiver.release();
}

const QString &Bridge::commandFor(const std::string &line) const
{
    if (line == StartMenuLine)
        return m_commands.startMenu;
    if (line == "VELWM_UPDATE_TOOLBAR")
        return m_commands.toolBar;
    if (line == "VELWM_UPDATE_SHORTCUT")
        return m_commands.shortcut;
    return m_commands.other;
}

void Bridge::obey(const std::string &line)
{
    if (commandFor(line).isEmpty())
        return;
    if (m_queue.add(line)) {
        startWaiting();
    } else if (!m_overflowTold) {
        m_overflowTold = true;
        Q_EMIT failed(QString::fromLocal8Bit(line.c_str()));
    }
}

void Bridge::startWaiting()
{
    while (const auto line = m_queue.start()) {
        if (m_shells.start(commandFor(*line), *line))
            continue;
        m_queue.end(*line);
        Q_EMIT failed(QString::fromLocal8Bit(line->c_str()));
    }
    if (m_queue.isEmpty())
        m_overflowTold = false;
}
