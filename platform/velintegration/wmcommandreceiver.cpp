// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include <velintegration/wmcommandreceiver.h>

#include <velintegration/wmcommand.h>

#include "ManagerSelection.h"

#include <memory>
#include <utility>

#include <X11/Xatom.h>

namespace {

struct CloseDisplay
{
    void operator()(Display *display) const { XCloseDisplay(display); }
};

// Longer than any property can be; the server cuts it to what is there.
constexpr long WholeProperty = 0x1fffffff;

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
    }

    void handle(const XEvent &event);
    void readProperty();
    void handOutLines();
    void lose();

    WmCommandReceiver::LineHandler onLine;
    WmCommandReceiver::LostHandler onLost;
    std::unique_ptr<Display, CloseDisplay> display;
    std::unique_ptr<ManagerSelection> selection;
    Atom property = None;
    std::string unfinished;
};

void WmCommandReceiverPrivate::handle(const XEvent &event)
{
    if (selection->isLoss(event)) {
        lose();
    } else if (event.type == SelectionRequest) {
        selection->answer(event.xselectionrequest);
    } else if (event.type == PropertyNotify && event.xproperty.window == selection->window()
               && event.xproperty.atom == property && event.xproperty.state == PropertyNewValue) {
        readProperty();
        handOutLines();
    }
}

// Reading and deleting is one request: what is appended meanwhile comes with the next event.
void WmCommandReceiverPrivate::readProperty()
{
    Atom type = None;
    int format = 0;
    unsigned long count = 0;
    unsigned long left = 0;
    unsigned char *data = nullptr;
    if (XGetWindowProperty(display.get(), selection->window(), property, 0, WholeProperty, True,
                           AnyPropertyType, &type, &format, &count, &left, &data)
            != Success
        || !data)
        return;
    if (type == XA_STRING && format == 8)
        unfinished.append(reinterpret_cast<const char *>(data), count);
    XFree(data);
}

void WmCommandReceiverPrivate::handOutLines()
{
    std::size_t end = 0;
    while ((end = unfinished.find('\n')) != std::string::npos) {
        const std::string line = unfinished.substr(0, end);
        unfinished.erase(0, end + 1);
        if (onLine)
            onLine(line);
    }
}

void WmCommandReceiverPrivate::lose()
{
    readProperty();
    selection->release();
    handOutLines();
    unfinished.clear();
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
    if (!d->selection || !d->selection->acquire(replace))
        return false;
    // Events that the connection has read already do not make it readable again.
    processEvents();
    return isOwner();
}

void WmCommandReceiver::release()
{
    if (!isOwner())
        return;
    d->readProperty();
    d->selection->release();
    d->handOutLines();
    d->unfinished.clear();
}

bool WmCommandReceiver::isOwner() const
{
    return d->selection && d->selection->window() != None;
}

int WmCommandReceiver::connectionFd() const
{
    return d->display ? ConnectionNumber(d->display.get()) : -1;
}

unsigned long WmCommandReceiver::windowId() const
{
    return d->selection ? d->selection->window() : None;
}

void WmCommandReceiver::processEvents()
{
    while (d->display && XPending(d->display.get()) > 0) {
        XEvent event;
        XNextEvent(d->display.get(), &event);
        d->handle(event);
    }
}
