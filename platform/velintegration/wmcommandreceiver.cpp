// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include <velintegration/wmcommandreceiver.h>

#include <velintegration/wmcommand.h>

#include "BusReceiver.h"
#include "CommandLines.h"
#include "ManagerSelection.h"
#include "XErrorTrap.h"

#include <cstdint>
#include <memory>
#include <utility>

#include <X11/Xatom.h>
#include <sys/epoll.h>
#include <unistd.h>

namespace {

struct CloseDisplay
{
    void operator()(Display *display) const { XCloseDisplay(display); }
};

// Of the property, in units of four bytes: what is read at a time, and what is read at all.
constexpr long ChunkLength = 64 * 1024;
constexpr long LongestProperty = 256 * ChunkLength;

// Milliseconds after which the rest of a line is not waited for any more.
constexpr std::uint32_t HalfLineLife = 1000;

// How often others may take the window away while events are handled; else that would never end.
constexpr int MostTimesKept = 16;

} // namespace

class WmCommandReceiverPrivate
{
public:
    WmCommandReceiverPrivate(WmCommandReceiver::LineHandler handler, const char *displayName)
        : onLine(std::move(handler))
        , display(XOpenDisplay(displayName))
    {
        if (!display)
            return;
        property = XInternAtom(display.get(), VelWmCommand::propertyName, False);
        selection.reset(
            new ManagerSelection(display.get(), VelWmCommand::selectionName(DefaultScreen(display.get()))));
        if (bus.descriptor() >= 0)
            waitForBoth();
    }
    ~WmCommandReceiverPrivate()
    {
        if (both >= 0)
            close(both);
    }

    void waitForBoth();
    int descriptor() const;
    bool isOwner() const;
    bool acquire(bool replace);
    void processBus();
    void processEvents();
    void handle(const XEvent &event);
    void noteChange(const XPropertyEvent &event);
    void readProperty();
    unsigned long readChunk(long offset);
    void handOutLines();
    void keep();
    void lose();

    WmCommandReceiver::LineHandler onLine;
    WmCommandReceiver::LostHandler onLost;
    std::unique_ptr<Display, CloseDisplay> display;
    std::unique_ptr<ManagerSelection> selection;
    BusReceiver bus;
    int both = -1; // can be read when the display or the bus can
    Atom property = None;
    CommandLines lines;
    bool hasNews = false; // the property has changed since it was read
    Time lastNews = 0;
    int timesKept = 0;
};

void WmCommandReceiverPrivate::waitForBoth()
{
    both = epoll_create1(EPOLL_CLOEXEC);
    for (const int descriptor : {ConnectionNumber(display.get()), bus.descriptor()}) {
        epoll_event event = {};
        event.events = EPOLLIN;
        epoll_ctl(both, EPOLL_CTL_ADD, descriptor, &event);
    }
}

int WmCommandReceiverPrivate::descriptor() const
{
    if (both >= 0)
        return both;
    return display ? ConnectionNumber(display.get()) : bus.descriptor();
}

// With a display it is the selection that counts; another receiver may have the bus.
bool WmCommandReceiverPrivate::isOwner() const
{
    return display ? selection->window() != None : bus.isOwner();
}

bool WmCommandReceiverPrivate::acquire(bool replace)
{
    if (display && !selection->acquire(replace))
        return false;
    return bus.acquire(replace) || display;
}

void WmCommandReceiverPrivate::processBus()
{
    const bool isLost = bus.read();
    std::string line;
    while (bus.take(&line)) {
        if (onLine)
            onLine(line);
    }
    if (isLost && !display && onLost)
        onLost();
}

// Reads the property once for all of its changes that are known, however many there are.
void WmCommandReceiverPrivate::processEvents()
{
    timesKept = 0;
    while (XPending(display.get()) > 0) {
        while (XQLength(display.get()) > 0) {
            XEvent event;
            XNextEvent(display.get(), &event);
            handle(event);
        }
        if (hasNews) {
            readProperty();
            handOutLines();
        }
    }
}

void WmCommandReceiverPrivate::handle(const XEvent &event)
{
    if (event.type == PropertyNotify) {
        noteChange(event.xproperty);
    } else if (event.type == SelectionRequest) {
        selection->answer(event.xselectionrequest);
    } else {
        const ManagerSelection::State state = selection->stateAfter(event);
        if (state == ManagerSelection::Endangered)
            keep();
        else if (state == ManagerSelection::Taken)
            lose();
    }
}

// The server's time tells how long nothing came, also when it was not looked at for long.
void WmCommandReceiverPrivate::noteChange(const XPropertyEvent &event)
{
    if (event.send_event || event.window != selection->window() || event.atom != property
        || event.state != PropertyNewValue)
        return;
    const auto pause = static_cast<std::uint32_t>(event.time - lastNews); // the time wraps around
    if (!hasNews && pause > HalfLineLife)
        lines.dropHalf();
    hasNews = true;
    lastNews = event.time;
}

// Others may destroy the window or cut the property short at any time.
void WmCommandReceiverPrivate::readProperty()
{
    hasNews = false;
    if (selection->window() == None)
        return;
    XErrorTrap trap(display.get());
    long offset = 0;
    unsigned long left = 0;
    do {
        left = readChunk(offset);
        offset += ChunkLength;
    } while (left > 0 && offset < LongestProperty);
    if (left > 0) {
        XDeleteProperty(display.get(), selection->window(), property);
        lines.dropHalf();
    }
}

// Reading the last chunk and deleting is one request: what is appended meanwhile comes with the
// next event. Returns how many bytes lie behind the chunk.
unsigned long WmCommandReceiverPrivate::readChunk(long offset)
{
    Atom type = None;
    int format = 0;
    unsigned long count = 0;
    unsigned long left = 0;
    unsigned char *data = nullptr;
    if (XGetWindowProperty(display.get(), selection->window(), property, offset, ChunkLength, True,
                           AnyPropertyType, &type, &format, &count, &left, &data)
            != Success
        || !data)
        return 0;
    if (type == XA_STRING && format == 8)
        lines.append(reinterpret_cast<const char *>(data), count);
    XFree(data);
    return left;
}

void WmCommandReceiverPrivate::handOutLines()
{
    std::string line;
    while (lines.take(&line)) {
        if (onLine)
            onLine(line);
    }
}

// What was in the property went with the window.
void WmCommandReceiverPrivate::keep()
{
    if (selection->window() == None) {
        hasNews = false;
        lines.dropHalf();
    }
    if (++timesKept > MostTimesKept || !selection->keep())
        lose();
}

void WmCommandReceiverPrivate::lose()
{
    readProperty();
    selection->release();
    bus.release();
    handOutLines();
    lines.clear();
    processBus();
    if (onLost)
        onLost();
}

WmCommandReceiver::WmCommandReceiver(LineHandler onLine, const char *displayName)
    : d(new WmCommandReceiverPrivate(std::move(onLine), displayName))
{
}

WmCommandReceiver::~WmCommandReceiver() = default;

void WmCommandReceiver::setLostHandler(LostHandler onLost)
{
    d->onLost = std::move(onLost);
}

bool WmCommandReceiver::acquire(bool replace)
{
    if (!d->acquire(replace))
        return false;
    // Events that the connection has read already do not make it readable again.
    processEvents();
    return isOwner();
}

void WmCommandReceiver::release()
{
    if (!isOwner())
        return;
    if (d->display) {
        d->readProperty();
        d->selection->release();
        d->handOutLines();
        d->lines.clear();
    }
    d->bus.release();
    d->processBus();
}

bool WmCommandReceiver::isOwner() const
{
    return d->isOwner();
}

int WmCommandReceiver::connectionFd() const
{
    return d->descriptor();
}

unsigned long WmCommandReceiver::windowId() const
{
    return d->selection ? d->selection->window() : None;
}

void WmCommandReceiver::processEvents()
{
    if (d->display)
        d->processEvents();
    d->processBus();
}
