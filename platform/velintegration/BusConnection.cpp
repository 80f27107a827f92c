// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "BusConnection.h"

#include <cstdlib>
#include <string>

#include <sys/stat.h>

namespace {

std::string variable(const char *name)
{
    const char *value = std::getenv(name);
    return value ? value : "";
}

std::string address()
{
    const std::string named = variable("DBUS_SESSION_BUS_ADDRESS");
    const std::string folder = variable("XDG_RUNTIME_DIR");
    struct stat status = {};
    if (!named.empty() || folder.empty() || folder.front() != '/')
        return named;
    const std::string socket = folder + "/bus";
    if (stat(socket.c_str(), &status) != 0 || !S_ISSOCK(status.st_mode))
        return {};
    const std::unique_ptr<char, void (*)(void *)> escaped(dbus_address_escape_value(socket.c_str()),
                                                          dbus_free);
    return escaped ? std::string("unix:path=") + escaped.get() : std::string();
}

} // namespace

void BusConnection::Close::operator()(DBusConnection *connection) const
{
    dbus_connection_close(connection);
    dbus_connection_unref(connection);
}

BusConnection::Pointer BusConnection::open()
{
    const std::string where = address();
    if (where.empty())
        return nullptr;
    Pointer connection(dbus_connection_open_private(where.c_str(), nullptr));
    if (!connection)
        return nullptr;
    dbus_connection_set_exit_on_disconnect(connection.get(), FALSE);
    return dbus_bus_register(connection.get(), nullptr) ? std::move(connection) : nullptr;
}
