// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "LineQueue.h"
#include "Shells.h"

#include <velintegration/wmcommandreceiver.h>

#include <QObject>
#include <QString>

/// The commands of a shell that the bridge runs; an empty one runs nothing.
struct BridgeCommands
{
    QString startMenu;
    QString toolBar;
    QString shortcut;
    QString other; ///< for every other line
};

/**
 * Stands in for the window manager on a desktop whose own one knows nothing of the channel: owns the
 * channel and runs a command for each kind of line.
 *
 * Lines that wait for their command are merged when they are equal (see LineQueue).
 */
class Bridge : public QObject
{
    Q_OBJECT

public:
    explicit Bridge(const BridgeCommands &commands, QObject *parent = nullptr);

    /**
     * Takes the channel and starts to listen.
     *
     * @param replace whether to take it from the program that has it
     * @return false without a display and a session bus, or when another program has the channel
     */
    bool start(bool replace);

    /// Runs the command for a changed start menu, as if a line had come.
    void updateStartMenu();

    /// Gives the channel up. Commands that run go on, those that still wait do not run.
    void stop();

Q_SIGNALS:
    /// Another program has taken the channel.
    void lost();
    /// The command for \a line cannot be run; of lines that come too fast the first is told.
    void failed(const QString &line);

private:
    const QString &commandFor(const std::string &line) const;
    void obey(const std::string &line);
    void startWaiting();

    const BridgeCommands m_commands;
    LineQueue m_queue;
    Shells m_shells;
    bool m_overflowTold = false;
    WmCommandReceiver m_receiver;
};
