// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ClipboardQuestion.h"

#include <QClipboard>
#include <QCoreApplication>
#include <QGuiApplication>

#include <algorithm>
#include <vector>

// Last: the macros of these headers hide names of Qt.
#include <X11/Xatom.h>
#include <X11/Xlib.h>
#include <X11/Xproto.h>

namespace {

constexpr long MostTypes = 4096;
constexpr int SentByAnybody = 0x7f; // what is left of the type of an event without its mark

Atom atom(const char *name)
{
    return XInternAtom(QtMajor::x11Display(), name, False);
}

QByteArrayList namesOf(std::vector<Atom> atoms)
{
    atoms.erase(std::remove(atoms.begin(), atoms.end(), Atom(None)), atoms.end());
    QByteArrayList result;
    std::vector<char *> names(atoms.size(), nullptr);
    if (atoms.empty() || !XGetAtomNames(QtMajor::x11Display(), atoms.data(), int(atoms.size()), names.data()))
        return result;
    for (char *name : names) {
        result.append(name);
        XFree(name);
    }
    return result;
}

} // namespace

ClipboardQuestion::ClipboardQuestion(QObject *parent)
    : QObject(parent)
{
    QCoreApplication::instance()->installNativeEventFilter(this);
}

ClipboardQuestion::~ClipboardQuestion()
{
    takeBack();
}

bool ClipboardQuestion::isNeeded()
{
    return QtMajor::x11Display() && !QGuiApplication::clipboard()->ownsClipboard()
        && XGetSelectionOwner(QtMajor::x11Display(), atom("CLIPBOARD")) != None;
}

void ClipboardQuestion::askForTypes()
{
    ask("TARGETS");
    m_isForTypes = true;
}

void ClipboardQuestion::askForData(const QByteArray &type)
{
    ask(type.constData());
    m_isForTypes = false;
}

// Each question has a window of its own, so that no late answer is taken for another one's, and that
// an owner who wants to send much hears at once that nobody takes it.
void ClipboardQuestion::ask(const char *type)
{
    takeBack();
    Display *const display = QtMajor::x11Display();
    m_window = XCreateSimpleWindow(display, DefaultRootWindow(display), -1, -1, 1, 1, 0, 0, 0);
    XConvertSelection(display, atom("CLIPBOARD"), atom(type), atom("_VEL_CLIPBOARD"), m_window, CurrentTime);
    XFlush(display);
}

void ClipboardQuestion::takeBack()
{
    // Without an application there is no display any more.
    if (m_window != 0 && QtMajor::x11Display()) {
        XDestroyWindow(QtMajor::x11Display(), m_window);
        XFlush(QtMajor::x11Display());
    }
    m_window = 0;
}

QByteArrayList ClipboardQuestion::offeredTypes() const
{
    Atom type = None;
    int format = 0;
    unsigned long count = 0;
    unsigned long left = 0;
    unsigned char *data = nullptr;
    std::vector<Atom> atoms;
    if (XGetWindowProperty(QtMajor::x11Display(), m_window, atom("_VEL_CLIPBOARD"), 0, MostTypes, False,
                           AnyPropertyType, &type, &format, &count, &left, &data)
            == Success
        && format == 32) {
        const auto *found = reinterpret_cast<const Atom *>(data);
        atoms.assign(found, found + count);
    }
    if (data)
        XFree(data);
    return namesOf(atoms);
}

bool ClipboardQuestion::nativeEventFilter(const QByteArray &eventType, void *message,
                                          QtMajor::NativeResult *result)
{
    Q_UNUSED(result)
    if (m_window == 0 || eventType != "xcb_generic_event_t")
        return false;
    // The bytes of an event are the same for every library.
    const auto *event = static_cast<const xEvent *>(message);
    if ((event->u.u.type & SentByAnybody) != SelectionNotify
        || event->u.selectionNotify.requestor != m_window)
        return false;
    const bool hasTypes = m_isForTypes && event->u.selectionNotify.property != None;
    const QByteArrayList types = hasTypes ? offeredTypes() : QByteArrayList();
    takeBack();
    Q_EMIT answered(types);
    return true;
}
