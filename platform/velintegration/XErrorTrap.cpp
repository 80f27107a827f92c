// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "XErrorTrap.h"

#include <mutex>

namespace {

// Xlib knows one handler a process and hands it no data of ours.
struct TrapState
{
    std::mutex mutex;
    Display *display = nullptr;
    unsigned long firstRequest = 0;
    XErrorHandler previous = nullptr;
    bool failed = false;
};

TrapState &trapState()
{
    static TrapState state;
    return state;
}

int handleError(Display *display, XErrorEvent *event)
{
    TrapState &state = trapState();
    if (display == state.display && event->serial >= state.firstRequest) {
        state.failed = true;
        return 0;
    }
    return state.previous ? state.previous(display, event) : 0;
}

} // namespace

XErrorTrap::XErrorTrap(Display *display)
{
    TrapState &state = trapState();
    state.mutex.lock();
    state.display = display;
    state.firstRequest = NextRequest(display);
    state.failed = false;
    state.previous = XSetErrorHandler(handleError);
}

XErrorTrap::~XErrorTrap()
{
    TrapState &state = trapState();
    // An error that is still on its way would reach the handler that is set again.
    XSync(state.display, False);
    XSetErrorHandler(state.previous);
    state.display = nullptr;
    state.mutex.unlock();
}

bool XErrorTrap::failed()
{
    XSync(trapState().display, False);
    return trapState().failed;
}
