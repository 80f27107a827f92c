// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <velintegration/wmcommandreceiver.h>

#include <QByteArray>
#include <QList>
#include <QSocketNotifier>

#include <string>

/// Takes the place of the window manager and collects what it is told.
class WindowManager : public QObject
{
public:
    WindowManager()
        : m_receiver([this](const std::string &line) { m_lines.append(QByteArray::fromStdString(line)); })
        , m_owns(m_receiver.acquire())
        , m_notifier(m_receiver.connectionFd(), QSocketNotifier::Read)
    {
        connect(&m_notifier, &QSocketNotifier::activated, this, [this] { m_receiver.processEvents(); });
    }

    /// Whether nobody else has that place.
    bool owns() const { return m_owns; }
    /// Every line that came until now.
    QList<QByteArray> lines()
    {
        m_receiver.processEvents();
        return m_lines;
    }

private:
    QList<QByteArray> m_lines;
    WmCommandReceiver m_receiver;
    bool m_owns;
    QSocketNotifier m_notifier;
};
