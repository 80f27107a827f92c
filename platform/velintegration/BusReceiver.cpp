// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "BusReceiver.h"

#include <velintegration/wmcommand.h>

#include <cstring>
#include <string>

namespace {

// How much is read before others get a turn, in reads of the socket.
constexpr int MostReads = 64;
constexpr long LargestQueue = 64 * 1024 * 1024;

bool isCommand(DBusMessage *message)
{
    return dbus_message_is_method_call(message, VelWmCommand::busName, VelWmCommand::busMethod)
        && dbus_message_has_path(message, VelWmCommand::busPath) && dbus_message_has_signature(message, "s");
}

bool saysThatTheNameIsLost(DBusMessage *message)
{
    const char *name = nullptr;
    return dbus_message_is_signal(message, DBUS_INTERFACE_LOCAL, "Disconnected")
        || (dbus_message_is_signal(message, DBUS_INTERFACE_DBUS, "NameLost")
            && dbus_message_has_sender(message, DBUS_SERVICE_DBUS)
            && dbus_message_get_args(message, nullptr, DBUS_TYPE_STRING, &name, DBUS_TYPE_INVALID)
            && std::strcmp(name, VelWmCommand::busName) == 0);
}

} // namespace

BusReceiver::BusReceiver()
    : m_connection(BusConnection::open())
{
    if (m_connection)
        dbus_connection_set_max_received_size(m_connection.get(), LargestQueue);
}

int BusReceiver::descriptor() const
{
    int descriptor = -1;
    return m_connection && dbus_connection_get_unix_fd(m_connection.get(), &descriptor) ? descriptor : -1;
}

bool BusReceiver::acquire(bool replace)
{
    if (!m_connection)
        return false;
    const unsigned flags = DBUS_NAME_FLAG_ALLOW_REPLACEMENT | DBUS_NAME_FLAG_DO_NOT_QUEUE
        | (replace ? DBUS_NAME_FLAG_REPLACE_EXISTING : 0U);
    const int reply = dbus_bus_request_name(m_connection.get(), VelWmCommand::busName, flags, nullptr);
    m_isOwner =
        reply == DBUS_REQUEST_NAME_REPLY_PRIMARY_OWNER || reply == DBUS_REQUEST_NAME_REPLY_ALREADY_OWNER;
    return m_isOwner;
}

// The answer comes after all that was sent while the name was ours.
void BusReceiver::release()
{
    if (!m_isOwner)
        return;
    dbus_bus_release_name(m_connection.get(), VelWmCommand::busName, nullptr);
    read();
    m_isOwner = false;
}

bool BusReceiver::read()
{
    if (!m_connection)
        return false;
    const bool wasOwner = m_isOwner;
    for (int reads = 0; reads < MostReads; ++reads) {
        dbus_connection_read_write(m_connection.get(), 0);
        bool hasMore = false;
        while (const BusConnection::Message message{dbus_connection_pop_message(m_connection.get())}) {
            handle(message.get());
            hasMore = true;
        }
        if (!hasMore)
            break;
    }
    return wasOwner && !m_isOwner;
}

// A message is whole: what follows is not the rest of its last line.
void BusReceiver::handle(DBusMessage *message)
{
    if (saysThatTheNameIsLost(message)) {
        m_isOwner = false;
        return;
    }
    const char *command = nullptr;
    const bool isObeyed = isCommand(message)
        && dbus_message_get_args(message, nullptr, DBUS_TYPE_STRING, &command, DBUS_TYPE_INVALID);
    if (isObeyed) {
        m_lines.append(command, std::strlen(command));
        m_lines.dropHalf();
    }
    if (dbus_message_get_type(message) == DBUS_MESSAGE_TYPE_METHOD_CALL
        && !dbus_message_get_no_reply(message))
        answer(message, isObeyed);
}

void BusReceiver::answer(DBusMessage *call, bool isObeyed)
{
    const BusConnection::Message reply(
        isObeyed ? dbus_message_new_method_return(call)
                 : dbus_message_new_error(call, DBUS_ERROR_UNKNOWN_METHOD, "Only commands are taken here."));
    if (reply)
        dbus_connection_send(m_connection.get(), reply.get(), nullptr);
    dbus_connection_read_write(m_connection.get(), 0);
}
