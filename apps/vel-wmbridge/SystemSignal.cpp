// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "SystemSignal.h"

#include <QSocketNotifier>

#include <cerrno>
#include <csignal>

#include <fcntl.h>
#include <unistd.h>

namespace {

// By the signal's number; set before the signal can come.
int pipeEnds[NSIG];

// Only what is safe inside a signal handler: wakes the event loop up.
void handleSignal(int number)
{
    const int before = errno;
    const char byte = 0;
    const ssize_t written = write(pipeEnds[number], &byte, 1);
    (void)written; // a full pipe does not block and wakes it up as well
    errno = before;
}

void empty(int descriptor)
{
    char bytes[256];
    while (read(descriptor, bytes, sizeof bytes) > 0) { }
}

} // namespace

SystemSignal::SystemSignal(std::initializer_list<int> signalNumbers, QObject *parent)
    : QObject(parent)
{
    // Not for the commands that the program runs, and no signal handler may wait.
    int ends[2] = {-1, -1};
    if (pipe2(ends, O_CLOEXEC | O_NONBLOCK) != 0)
        return;
    auto *notifier = new QSocketNotifier(ends[0], QSocketNotifier::Read, this);
    connect(notifier, &QSocketNotifier::activated, this, [this, from = ends[0]] {
        empty(from);
        Q_EMIT caught();
    });
    struct sigaction action = {};
    action.sa_handler = handleSignal;
    action.sa_flags = SA_RESTART | SA_NOCLDSTOP;
    for (const int number : signalNumbers) {
        pipeEnds[number] = ends[1];
        sigaction(number, &action, nullptr);
    }
}
