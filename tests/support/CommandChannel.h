// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QByteArray>

#include <X11/Xlib.h>

/**
 * Owns the selection of the window manager and collects the raw bytes that arrive.
 *
 * Written against the protocol and not with our own receiver, which a test may have to judge.
 * Include it last: the macros of Xlib's header hide names of Qt.
 */
class CommandChannel
{
public:
    CommandChannel()
        : m_display(XOpenDisplay(nullptr))
        , m_window(XCreateSimpleWindow(m_display, DefaultRootWindow(m_display), 0, 0, 1, 1, 0, 0, 0))
        , m_property(XInternAtom(m_display, "_VELWM_COMMAND", 0))
    {
        XSelectInput(m_display, m_window, PropertyChangeMask);
        XSetSelectionOwner(m_display, selection(m_display), m_window, CurrentTime);
        XSync(m_display, 0);
    }
    ~CommandChannel() { XCloseDisplay(m_display); }
    Q_DISABLE_COPY_MOVE(CommandChannel)

    /// Whether anybody owns the selection.
    static bool isTaken()
    {
        Display *display = XOpenDisplay(nullptr);
        const Window owner = XGetSelectionOwner(display, selection(display));
        XCloseDisplay(display);
        return owner != 0;
    }

    QByteArray bytes()
    {
        Atom type = 0;
        int format = 0;
        unsigned long count = 0;
        unsigned long rest = 0;
        unsigned char *data = nullptr;
        XGetWindowProperty(m_display, m_window, m_property, 0, 1024, 1, AnyPropertyType, &type, &format,
                           &count, &rest, &data);
        if (data)
            m_bytes += QByteArray(reinterpret_cast<const char *>(data), int(count));
        XFree(data);
        return m_bytes;
    }

private:
    static Atom selection(Display *display)
    {
        const QByteArray name = "_VELWM_COMMAND_S" + QByteArray::number(DefaultScreen(display));
        return XInternAtom(display, name.constData(), 0);
    }

    Display *m_display;
    Window m_window;
    Atom m_property;
    QByteArray m_bytes;
};
