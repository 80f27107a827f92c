// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ManagerSelection.h"

#include "XErrorTrap.h"

#include <chrono>
#include <climits>

#include <X11/Xatom.h>
#include <poll.h>

namespace {

constexpr std::chrono::seconds ReleaseTimeout(5);

struct PropertyOf
{
    Window window;
    Atom property;
};

Bool isPropertyChange(Display *, XEvent *event, XPointer argument)
{
    const auto *wanted = reinterpret_cast<const PropertyOf *>(argument);
    return event->type == PropertyNotify && !event->xproperty.send_event
        && event->xproperty.window == wanted->window && event->xproperty.atom == wanted->property;
}

} // namespace

ManagerSelection::ManagerSelection(Display *display, const std::string &name)
    : m_display(display)
    , m_selection(XInternAtom(display, name.c_str(), False))
{
}

ManagerSelection::~ManagerSelection()
{
    release();
}

Atom ManagerSelection::atom(const char *name) const
{
    return XInternAtom(m_display, name, False);
}

bool ManagerSelection::acquire(bool replace)
{
    if (m_window != None)
        return true;
    Window previous = XGetSelectionOwner(m_display, m_selection);
    if (previous != None && !replace)
        return false;
    if (previous != None) {
        XErrorTrap trap(m_display);
        XSelectInput(m_display, previous, StructureNotifyMask);
        if (trap.failed())
            previous = None; // gone meanwhile
    }
    makeWindow();
    if (!own()) {
        release();
        return false;
    }
    if (previous != None)
        waitForRelease(previous);
    announce();
    return true;
}

void ManagerSelection::release()
{
    if (m_window == None)
        return;
    XErrorTrap trap(m_display); // others may have destroyed it
    XDestroyWindow(m_display, m_window);
    m_window = None;
}

void ManagerSelection::makeWindow()
{
    XSetWindowAttributes attributes = {};
    attributes.event_mask = PropertyChangeMask | StructureNotifyMask;
    attributes.override_redirect = True;
    m_window = XCreateWindow(m_display, DefaultRootWindow(m_display), -1, -1, 1, 1, 0, CopyFromParent,
                             InputOnly, CopyFromParent, CWEventMask | CWOverrideRedirect, &attributes);
}

// Others may destroy the window in between.
bool ManagerSelection::own()
{
    XErrorTrap trap(m_display);
    if (!fetchServerTime())
        return false;
    XSetSelectionOwner(m_display, m_selection, m_window, m_time);
    return XGetSelectionOwner(m_display, m_selection) == m_window;
}

// The time stamp of a property change is the one way to ask for the server's time.
bool ManagerSelection::fetchServerTime()
{
    PropertyOf wanted = {m_window, atom("TIMESTAMP")};
    XChangeProperty(m_display, m_window, wanted.property, XA_INTEGER, 32, PropModeAppend, nullptr, 0);
    XSync(m_display, False);
    XEvent event;
    if (!XCheckIfEvent(m_display, &event, isPropertyChange, reinterpret_cast<XPointer>(&wanted)))
        return false;
    m_time = event.xproperty.time;
    return true;
}

void ManagerSelection::waitForRelease(Window previous)
{
    const auto deadline = std::chrono::steady_clock::now() + ReleaseTimeout;
    XEvent event;
    while (!XCheckTypedWindowEvent(m_display, previous, DestroyNotify, &event)) {
        const auto left = std::chrono::duration_cast<std::chrono::milliseconds>(
            deadline - std::chrono::steady_clock::now());
        if (left.count() <= 0)
            return;
        pollfd descriptor = {ConnectionNumber(m_display), POLLIN, 0};
        poll(&descriptor, 1, static_cast<int>(left.count()));
    }
}

void ManagerSelection::announce()
{
    XEvent event = {};
    event.xclient.type = ClientMessage;
    event.xclient.window = DefaultRootWindow(m_display);
    event.xclient.message_type = atom("MANAGER");
    event.xclient.format = 32;
    event.xclient.data.l[0] = static_cast<long>(m_time);
    event.xclient.data.l[1] = static_cast<long>(m_selection);
    event.xclient.data.l[2] = static_cast<long>(m_window);
    XSendEvent(m_display, DefaultRootWindow(m_display), False, StructureNotifyMask, &event);
    XFlush(m_display);
}

ManagerSelection::State ManagerSelection::stateAfter(const XEvent &event)
{
    const bool isDestruction = event.type == DestroyNotify && event.xdestroywindow.window == m_window;
    const bool isLoss = event.type == SelectionClear && event.xselectionclear.window == m_window
        && event.xselectionclear.selection == m_selection;
    if (event.xany.send_event || m_window == None || (!isDestruction && !isLoss))
        return Unchanged;
    if (isDestruction)
        m_window = None;
    const Window owner = XGetSelectionOwner(m_display, m_selection);
    if (isDestruction)
        return owner == None ? Endangered : Taken;
    // Another client named this window as the owner; when that client ends, so would the selection.
    return owner == m_window ? Endangered : Taken;
}

void ManagerSelection::answer(const XSelectionRequestEvent &request)
{
    XEvent reply = {};
    reply.xselection.type = SelectionNotify;
    reply.xselection.requestor = request.requestor;
    reply.xselection.selection = request.selection;
    reply.xselection.target = request.target;
    reply.xselection.time = request.time;
    // Clients of the old conventions name no property and mean the target's.
    const Atom property = request.property != None ? request.property : request.target;

    XErrorTrap trap(m_display); // the requestor may be gone
    const bool isOurs = request.selection == m_selection && request.owner == m_window;
    const bool done = isOurs
        && (request.target == atom("MULTIPLE") ? convertMultiple(request.requestor, request.property)
                                               : convert(request.requestor, request.target, property));
    reply.xselection.property = done ? property : None;
    XSendEvent(m_display, request.requestor, False, NoEventMask, &reply);
}

bool ManagerSelection::convert(Window requestor, Atom target, Atom property)
{
    if (target == atom("TARGETS")) {
        const Atom targets[] = {atom("TARGETS"), atom("MULTIPLE"), atom("TIMESTAMP")};
        XChangeProperty(m_display, requestor, property, XA_ATOM, 32, PropModeReplace,
                        reinterpret_cast<const unsigned char *>(targets), 3);
        return true;
    }
    if (target == atom("TIMESTAMP")) {
        const long time = static_cast<long>(m_time);
        XChangeProperty(m_display, requestor, property, XA_INTEGER, 32, PropModeReplace,
                        reinterpret_cast<const unsigned char *>(&time), 1);
        return true;
    }
    return false;
}

// The property lists pairs of target and property; what cannot be converted gets None.
bool ManagerSelection::convertMultiple(Window requestor, Atom property)
{
    if (property == None)
        return false;
    Atom type = None;
    int format = 0;
    unsigned long count = 0;
    unsigned long left = 0;
    unsigned char *data = nullptr;
    if (XGetWindowProperty(m_display, requestor, property, 0, 256, False, AnyPropertyType, &type, &format,
                           &count, &left, &data)
            != Success
        || !data)
        return false;
    const bool arePairs = format == 32 && count % 2 == 0 && left == 0;
    if (arePairs) {
        Atom *atoms = reinterpret_cast<Atom *>(data);
        for (unsigned long i = 0; i < count; i += 2) {
            if (!convert(requestor, atoms[i], atoms[i + 1]))
                atoms[i + 1] = None;
        }
        XChangeProperty(m_display, requestor, property, type, 32, PropModeReplace, data,
                        static_cast<int>(count));
    }
    XFree(data);
    return arePairs;
}
