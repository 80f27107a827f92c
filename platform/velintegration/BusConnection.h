// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <memory>

#include <dbus/dbus.h>

/**
 * A connection of our own to the session bus, which disturbs nobody else's.
 *
 * No bus is started for it: the one that DBUS_SESSION_BUS_ADDRESS names is taken, else the socket "bus"
 * in XDG_RUNTIME_DIR.
 */
namespace BusConnection {

struct Close
{
    void operator()(DBusConnection *connection) const;
};
using Pointer = std::unique_ptr<DBusConnection, Close>;

struct Release
{
    void operator()(DBusMessage *message) const { dbus_message_unref(message); }
};
using Message = std::unique_ptr<DBusMessage, Release>;

/// Null when there is no bus.
Pointer open();

} // namespace BusConnection
