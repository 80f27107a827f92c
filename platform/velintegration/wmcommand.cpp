// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include <velintegration/wmcommand.h>

#include "BusSender.h"
#include "XErrorTrap.h"

#include <cstring>

#include <X11/Xatom.h>
#include <X11/Xlib.h>

namespace {

// What one request can carry besides its header; Xlib would send an empty one instead.
std::size_t longestCommand(Display *display)
{
    const long extended = XExtendedMaxRequestSize(display);
    const long words = extended > 0 ? extended : XMaxRequestSize(display);
    return static_cast<std::size_t>(words) * 4 - 64;
}

} // namespace

bool SendCommandToWM(Display *display, const char *command)
{
    if (!command)
        return false;
    if (!display)
        return sendCommandOverBus(command);
    const std::size_t length = std::strlen(command);
    if (length > longestCommand(display))
        return false;

    XErrorTrap trap(display);
    const std::string selection = VelWmCommand::selectionName(DefaultScreen(display));
    const Window owner = XGetSelectionOwner(display, XInternAtom(display, selection.c_str(), False));
    if (owner == None)
        return false;
    XChangeProperty(display, owner, XInternAtom(display, VelWmCommand::propertyName, False), XA_STRING, 8,
                    PropModeAppend, reinterpret_cast<const unsigned char *>(command),
                    static_cast<int>(length));
    return !trap.failed();
}
