// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "BusConnection.h"
#include "CommandLines.h"

/// The receiver's end of the channel on the session bus.
class BusReceiver
{
public:
    /// Connects to the bus, if there is one.
    BusReceiver();

    /// Can be read when something has come; -1 without a bus.
    int descriptor() const;

    /// Takes the name; from its owner only if \a replace is true.
    bool acquire(bool replace);
    /// Gives the name up; what has come stays to be taken.
    void release();
    bool isOwner() const { return m_isOwner; }

    /// Reads what has come; never waits. Whether the name was lost.
    bool read();
    /// Takes the next line that was read; false when there is none.
    bool take(std::string *line) { return m_lines.take(line); }

private:
    void handle(DBusMessage *message);
    void answer(DBusMessage *call, bool isObeyed);

    BusConnection::Pointer m_connection;
    CommandLines m_lines;
    bool m_isOwner = false;
};
