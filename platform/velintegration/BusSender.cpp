// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "BusSender.h"

#include "BusConnection.h"

#include <velintegration/wmcommand.h>

#include <cstring>

namespace {

// As much as one request of an X server can carry.
constexpr std::size_t LongestCommand = 16 * 1024 * 1024 - 64;

} // namespace

bool sendCommandOverBus(const char *command)
{
    if (std::strlen(command) > LongestCommand || !dbus_validate_utf8(command, nullptr))
        return false;
    const BusConnection::Pointer connection = BusConnection::open();
    const auto hasReceiver = [&connection] {
        return dbus_bus_name_has_owner(connection.get(), VelWmCommand::busName, nullptr) != FALSE;
    };
    if (!connection || !hasReceiver())
        return false;
    const BusConnection::Message call(dbus_message_new_method_call(
        VelWmCommand::busName, VelWmCommand::busPath, VelWmCommand::busName, VelWmCommand::busMethod));
    if (!call || !dbus_message_append_args(call.get(), DBUS_TYPE_STRING, &command, DBUS_TYPE_INVALID))
        return false;
    // Whoever takes it may take its time. The bus answers in turn: when it says that there still is a
    // receiver, it has handed the command on.
    dbus_message_set_no_reply(call.get(), TRUE);
    dbus_message_set_auto_start(call.get(), FALSE);
    return dbus_connection_send(connection.get(), call.get(), nullptr) && hasReceiver();
}
