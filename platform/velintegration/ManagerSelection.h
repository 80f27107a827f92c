// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <string>

#include <X11/Xlib.h>

/**
 * A manager selection of the default screen, as the ICCCM describes it: who has it, has the
 * say. Does not own the display. Every operation needs a display.
 */
class ManagerSelection
{
public:
    /// What an event tells about the selection.
    enum State {
        Unchanged,
        Taken, ///< another client has it, or took it away
        Endangered, ///< others have destroyed the window or claimed it; keep() helps
    };

    ManagerSelection(Display *display, const std::string &name);
    ~ManagerSelection();
    ManagerSelection(const ManagerSelection &) = delete;
    ManagerSelection &operator=(const ManagerSelection &) = delete;

    /// Takes the selection with a new window; from its owner only if \a replace is true.
    bool acquire(bool replace);

    /// Destroys the window, by which others see that the selection is free.
    void release();

    /// The window that owns the selection, None without; properties of it are watched.
    Window window() const { return m_window; }

    /// Answers a question about the selection.
    void answer(const XSelectionRequestEvent &request);

    /// What \a event tells; the server is asked, since anybody can send events.
    State stateAfter(const XEvent &event);

    /// Takes the selection again, with a new window when there is none; false when that fails.
    bool keep() { return m_window == None ? acquire(false) : own(); }

private:
    Atom atom(const char *name) const;
    void makeWindow();
    bool own();
    bool fetchServerTime();
    void waitForRelease(Window previous);
    void announce();
    bool convert(Window requestor, Atom target, Atom property);
    bool convertMultiple(Window requestor, Atom property);

    Display *m_display;
    Atom m_selection;
    Window m_window = None;
    Time m_time = CurrentTime;
};
