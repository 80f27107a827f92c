// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// clipboard_owner_child TYPES DATA [TEXT [BROWSER]]
//
// Owns the clipboard of the X server. TYPES and DATA tell how often it answers when it is asked for
// the types that it offers, which are those of files, and for what they hold, which is TEXT; never
// after that. With BROWSER, whatever that is, it offers an address as browsers do, TEXT in UTF-16,
// and refuses all other types. Prints "ready", then "asked" and the type for each question.

#include <cstdio>
#include <cstdlib>
#include <string>

#include <X11/Xatom.h>
#include <X11/Xlib.h>

namespace {

void send(Display *display, const XSelectionRequestEvent &request)
{
    XEvent event = {};
    event.xselection.type = SelectionNotify;
    event.xselection.requestor = request.requestor;
    event.xselection.selection = request.selection;
    event.xselection.target = request.target;
    event.xselection.property = request.property;
    event.xselection.time = request.time;
    XSendEvent(display, request.requestor, False, NoEventMask, &event);
    XFlush(display);
}

void answer(Display *display, const XSelectionRequestEvent &request, Atom type, int format,
            const unsigned char *data, int count)
{
    XChangeProperty(display, request.requestor, request.property, type, format, PropModeReplace, data, count);
    send(display, request);
}

void refuse(Display *display, XSelectionRequestEvent request)
{
    request.property = None;
    send(display, request);
}

int ignoreError(Display *, XErrorEvent *)
{
    return 0;
}

} // namespace

int main(int argc, char **argv)
{
    Display *const display = XOpenDisplay(nullptr);
    if (argc < 3 || !display)
        return 2;
    int types = std::atoi(argv[1]);
    int data = std::atoi(argv[2]);
    std::string text = argc > 3 ? argv[3] : "";
    const bool isBrowser = argc > 4;
    for (std::size_t i = 1; isBrowser && i <= text.size(); i += 2)
        text.insert(i, 1, '\0');
    // Who asked may be gone.
    XSetErrorHandler(ignoreError);
    const Window window = XCreateSimpleWindow(display, DefaultRootWindow(display), 0, 0, 1, 1, 0, 0, 0);
    const Atom targets = XInternAtom(display, "TARGETS", False);
    const Atom list = XInternAtom(display, isBrowser ? "text/x-moz-url" : "text/uri-list", False);
    const Atom clipboard = XInternAtom(display, "CLIPBOARD", False);
    XSetSelectionOwner(display, clipboard, window, CurrentTime);
    XSync(display, False);
    std::setvbuf(stdout, nullptr, _IOLBF, BUFSIZ);
    std::puts("ready");
    for (;;) {
        XEvent event;
        XNextEvent(display, &event);
        if (event.type == SelectionClear)
            return 0;
        if (event.type != SelectionRequest)
            continue;
        const XSelectionRequestEvent &request = event.xselectionrequest;
        char *const name = XGetAtomName(display, request.target);
        std::printf("asked %s\n", name);
        XFree(name);
        const Atom offered[] = {targets, list};
        if (request.target == targets && types-- > 0)
            answer(display, request, XA_ATOM, 32, reinterpret_cast<const unsigned char *>(offered), 2);
        else if (request.target == list && data-- > 0)
            answer(display, request, list, 8, reinterpret_cast<const unsigned char *>(text.data()),
                   int(text.size()));
        else if (isBrowser)
            refuse(display, request);
    }
}
