// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ServerKeyboard.h"

#include <QCoreApplication>
#include <QDeadlineTimer>
#include <QSet>
#include <QTimer>

#include <cstring>
#include <memory>

#include <X11/XKBlib.h>
#include <X11/extensions/XTest.h>
#include <X11/keysym.h>
#include <xcb/xcb.h>

namespace {

struct MapDeleter
{
    void operator()(XkbDescPtr map) const { XkbFreeKeyboard(map, XkbAllComponentsMask, True); }
};
using Map = std::unique_ptr<XkbDescRec, MapDeleter>;

Map readMap(Display *display)
{
    return Map(XkbGetMap(display, XkbAllMapComponentsMask, XkbUseCoreKbd));
}

// The keys that are held for the modifiers; what is locked needs none.
const struct
{
    ServerKeyboard::Modifier modifier;
    KeySym symbol;
} heldKeys[] = {
    {ServerKeyboard::Shift, XK_Shift_L},
    {ServerKeyboard::Control, XK_Control_L},
    {ServerKeyboard::Alt, XK_Alt_L},
    {ServerKeyboard::Super, XK_Super_L},
    {ServerKeyboard::AltGr, XK_ISO_Level3_Shift},
};

// The modifiers of the server, as they are named in its protocol.
unsigned int maskOf(int modifiers)
{
    const struct
    {
        ServerKeyboard::Modifier modifier;
        unsigned int mask;
    } masks[] = {
        {ServerKeyboard::Shift, ShiftMask},  {ServerKeyboard::Control, ControlMask},
        {ServerKeyboard::Alt, Mod1Mask},     {ServerKeyboard::Super, Mod4Mask},
        {ServerKeyboard::AltGr, Mod5Mask},   {ServerKeyboard::CapsLock, LockMask},
        {ServerKeyboard::NumLock, Mod2Mask},
    };
    unsigned int mask = 0;
    for (const auto &entry : masks)
        mask |= modifiers & entry.modifier ? entry.mask : 0;
    return mask;
}

QSet<KeySym> reachableSymbols(Display *display)
{
    QSet<KeySym> symbols;
    const Map map = readMap(display);
    for (int code = map->min_key_code; code <= map->max_key_code; ++code) {
        for (int modifiers = 0; modifiers <= ServerKeyboard::AllModifiers; ++modifiers) {
            unsigned int consumed = 0;
            KeySym symbol = NoSymbol;
            if (XkbTranslateKeyCode(map.get(), KeyCode(code), maskOf(modifiers), &consumed, &symbol))
                symbols.insert(symbol);
        }
    }
    return symbols;
}

QSet<KeySym> allSymbols(Display *display)
{
    QSet<KeySym> symbols;
    const Map map = readMap(display);
    for (int code = map->min_key_code; code <= map->max_key_code; ++code) {
        for (int i = 0; i < XkbKeyNumSyms(map.get(), code); ++i)
            symbols.insert(XkbKeySymsPtr(map.get(), code)[i]);
    }
    symbols.remove(NoSymbol);
    return symbols;
}

} // namespace

ServerKeyboard::ServerKeyboard(const QWindow &window)
    : m_display(XOpenDisplay(nullptr))
    , m_window(window.winId())
    , m_marker(XInternAtom(m_display, "_VEL_TEST_MARKER", False))
{
    QCoreApplication::instance()->installNativeEventFilter(this);
}

ServerKeyboard::~ServerKeyboard()
{
    hold(0);
    QCoreApplication::instance()->removeNativeEventFilter(this);
    XCloseDisplay(m_display);
}

QVector<int> ServerKeyboard::codes() const
{
    QVector<int> codes;
    int first = 0;
    int last = 0;
    XDisplayKeycodes(m_display, &first, &last);
    for (int code = first; code <= last; ++code) {
        if (!m_held.contains(code))
            codes.append(code);
    }
    return codes;
}

int ServerKeyboard::symbolCount() const
{
    return allSymbols(m_display).size();
}

int ServerKeyboard::reachableSymbolCount() const
{
    return (allSymbols(m_display) & reachableSymbols(m_display)).size();
}

bool ServerKeyboard::hold(int modifiers)
{
    for (int code : qAsConst(m_held))
        send(code, false);
    m_held.clear();
    m_locked = maskOf(modifiers & (CapsLock | NumLock));
    setLocks();
    bool isHeld = true;
    for (const auto &key : heldKeys) {
        if (!(modifiers & key.modifier))
            continue;
        const int code = XKeysymToKeycode(m_display, key.symbol);
        isHeld = isHeld && code != 0;
        if (code != 0) {
            m_held.append(code);
            send(code, true);
        }
    }
    XSync(m_display, False);
    XkbStateRec state = {};
    return XkbGetState(m_display, XkbUseCoreKbd, &state) == Success && state.mods == maskOf(modifiers)
        && isHeld;
}

// Also the keys that move the mouse, which Shift and Num Lock switch on.
void ServerKeyboard::setLocks()
{
    XkbLockModifiers(m_display, XkbUseCoreKbd, 0xff, m_locked);
    XkbLatchModifiers(m_display, XkbUseCoreKbd, 0xff, 0);
    XkbLockGroup(m_display, XkbUseCoreKbd, 0);
    XkbChangeEnabledControls(m_display, XkbUseCoreKbd,
                             XkbMouseKeysMask | XkbStickyKeysMask | XkbSlowKeysMask | XkbBounceKeysMask
                                 | XkbOverlay1Mask | XkbOverlay2Mask,
                             0);
}

void ServerKeyboard::press(int code)
{
    // A key that is released and pressed within a millisecond counts as held.
    constexpr unsigned long Pause = 1;
    XTestFakeKeyEvent(m_display, unsigned(code), True, Pause);
    send(code, false);
    setLocks();
}

void ServerKeyboard::send(int code, bool isDown)
{
    XTestFakeKeyEvent(m_display, unsigned(code), isDown, CurrentTime);
}

// The server answers in the order of the requests, so that the marker follows the keys.
bool ServerKeyboard::wait()
{
    XEvent event = {};
    event.xclient.type = ClientMessage;
    event.xclient.window = m_window;
    event.xclient.message_type = m_marker;
    event.xclient.format = 32;
    event.xclient.data.l[0] = long(++m_sent);
    XSendEvent(m_display, m_window, False, NoEventMask, &event);
    XFlush(m_display);

    QTimer wakeUp;
    wakeUp.start(100);
    const QDeadlineTimer deadline(10000);
    while (m_arrived != m_sent && !deadline.hasExpired())
        QCoreApplication::processEvents(QEventLoop::WaitForMoreEvents);
    QCoreApplication::processEvents();
    return m_arrived == m_sent;
}

bool ServerKeyboard::nativeEventFilter(const QByteArray &type, void *message, QtMajor::NativeResult *result)
{
    Q_UNUSED(result)
    if (type != "xcb_generic_event_t")
        return false;
    const auto *event = static_cast<const xcb_client_message_event_t *>(message);
    if ((event->response_type & 0x7f) != XCB_CLIENT_MESSAGE || event->type != m_marker)
        return false;
    m_arrived = event->data.data32[0];
    return true;
}
