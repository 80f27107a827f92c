// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <X11/Xlib.h>

/**
 * Keeps X errors of the requests made while it lives from the handler that is set.
 *
 * Errors of other displays, and of requests made earlier, are handed to that handler, which
 * is set again in the end. Traps of several threads wait for one another; they do not nest.
 */
class XErrorTrap
{
public:
    explicit XErrorTrap(Display *display);
    ~XErrorTrap();
    XErrorTrap(const XErrorTrap &) = delete;
    XErrorTrap &operator=(const XErrorTrap &) = delete;

    /// Waits for the server to have seen all requests; whether one of them failed.
    bool failed();
};
