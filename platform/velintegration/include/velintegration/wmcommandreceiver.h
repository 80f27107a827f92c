// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <velintegration/velintegration_export.h>

#include <functional>
#include <memory>
#include <string>

class WmCommandReceiverPrivate;

/**
 * The window manager's side of the command channel.
 *
 * Takes the manager selection VelWmCommand::selectionName() of the default screen as the
 * ICCCM describes (with a time stamp, announced by a MANAGER message to the root window,
 * answering TARGETS, MULTIPLE and TIMESTAMP) and calls back with each line that is sent.
 *
 * The same lines are taken over the session bus, from programs that have no X display: as the owner of
 * VelWmCommand::busName, where there is a bus and nobody else has the name. Without a display that name
 * is what counts; with one it is the selection, whoever has the name.
 *
 * It has connections of its own, so it needs no toolkit and disturbs none: wait until
 * connectionFd() can be read and call processEvents(). In a Qt program:
 *
 * \code
 * WmCommandReceiver receiver([](const std::string &line) { obey(line); });
 * if (!receiver.acquire())
 *     return 1;
 * QSocketNotifier notifier(receiver.connectionFd(), QSocketNotifier::Read);
 * QObject::connect(&notifier, &QSocketNotifier::activated, [&] { receiver.processEvents(); });
 * \endcode
 *
 * Each line is handed out, equal ones too, but for a line above VelWmCommand::LongestLine, for the
 * first part of a line when nothing follows it within a second (whoever sent it may be gone), and
 * for what lies beyond 64 MiB when so much has come since the last call.
 *
 * A message on the bus is whole: what stands in it behind its last line feed is no line.
 *
 * The selection is lost to a successor alone. When others destroy the window, a new one takes its
 * place, and windowId() changes.
 *
 * All calls come from one thread. The callbacks run inside acquire() and processEvents() and
 * may not delete the receiver.
 *
 * \since 1.0
 */
class VELINTEGRATION_EXPORT WmCommandReceiver
{
public:
    /// Called with one line, without its line feed.
    using LineHandler = std::function<void(const std::string &line)>;
    /// Called when another program has taken the selection, or nothing helps to keep it.
    using LostHandler = std::function<void()>;

    /**
     * Connects to the display and the session bus, as far as they are there; does not take the selection yet.
     *
     * @param onLine called with each line that arrives
     * @param displayName the display; null for that of the environment
     */
    explicit WmCommandReceiver(LineHandler onLine, const char *displayName = nullptr);

    /// Gives the selection up and ends the connection.
    ~WmCommandReceiver();

    WmCommandReceiver(const WmCommandReceiver &) = delete;
    WmCommandReceiver &operator=(const WmCommandReceiver &) = delete;

    /// Sets what is called when the selection is lost.
    void setLostHandler(LostHandler onLost);

    /**
     * Takes the selection.
     *
     * @param replace true takes it from the program that has it, and waits up to five seconds
     *        for that program to let go; false leaves it there
     * @return whether this receiver owns the selection now, or the name where there is no display; false
     *         without both
     */
    bool acquire(bool replace = false);

    /// Gives the selection up; lines that have arrived are handed out first.
    void release();

    /// Whether this receiver owns the selection (without a display: the name), as far as processed events
    /// tell.
    bool isOwner() const;

    /// The file descriptor to wait on for reading; -1 without a display and a bus.
    int connectionFd() const;

    /// The id of the X window that owns the selection; 0 when there is none.
    unsigned long windowId() const;

    /// Handles all events that have arrived; never waits.
    void processEvents();

private:
    std::unique_ptr<WmCommandReceiverPrivate> d;
};
