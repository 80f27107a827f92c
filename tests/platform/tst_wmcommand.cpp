// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <velintegration/wmcommand.h>

#include <memory>
#include <vector>

#include <X11/Xatom.h>
#include <X11/Xlib.h>

struct CloseDisplay
{
    void operator()(Display *display) const { XCloseDisplay(display); }
};
using DisplayPointer = std::unique_ptr<Display, CloseDisplay>;

// What the handler that a host has set was called with.
static std::vector<unsigned char> s_hostErrors;

static int hostErrorHandler(Display *, XErrorEvent *event)
{
    s_hostErrors.push_back(event->error_code);
    return 0;
}

class WmCommandTest : public TestCase
{
    Q_OBJECT

private:
    Window takeSelection();
    QByteArray commands(Window window, Atom *type, int *format);

    DisplayPointer m_manager; // the window manager's connection
    DisplayPointer m_host; // the application's

private Q_SLOTS:
    void init();
    void cleanup();

    void failsWithoutADisplay();
    void failsWithoutACommand();
    void failsWhenNobodyOwnsTheSelection();
    void failsWhenTheOwnerIsGone();
    void appendsTheBytesToThePropertyOfTheOwner();
    void hasArrivedWhenTheCallReturns();
    void takesALongCommand();
    void errorsOfItsOwnRequestsEndInTheCall();
    void earlierErrorsGoToTheHandlerOfTheHost();
    void putsTheHandlerOfTheHostBack();
    void leavesTheEventsOfTheHostInTheQueue();
};

void WmCommandTest::init()
{
    TestCase::init();
    s_hostErrors.clear();
    m_manager.reset(XOpenDisplay(nullptr));
    m_host.reset(XOpenDisplay(nullptr));
    QVERIFY(m_manager && m_host);
    XSetErrorHandler(hostErrorHandler);
}

void WmCommandTest::cleanup()
{
    m_manager.reset();
    m_host.reset();
    XSetErrorHandler(nullptr);
    TestCase::cleanup();
}

// A bare owner that reads nothing, so that the property shows what was sent.
Window WmCommandTest::takeSelection()
{
    Display *display = m_manager.get();
    const Window window = XCreateSimpleWindow(display, DefaultRootWindow(display), 0, 0, 1, 1, 0, 0, 0);
    XSetSelectionOwner(display, XInternAtom(display, "_VELWM_COMMAND_S0", False), window, CurrentTime);
    XSync(display, False);
    return window;
}

QByteArray WmCommandTest::commands(Window window, Atom *type, int *format)
{
    unsigned long count = 0;
    unsigned long left = 0;
    unsigned char *data = nullptr;
    XGetWindowProperty(m_manager.get(), window, XInternAtom(m_manager.get(), "_VELWM_COMMAND", False), 0,
                       0x1fffffff, False, AnyPropertyType, type, format, &count, &left, &data);
    const QByteArray bytes(reinterpret_cast<const char *>(data), static_cast<int>(count));
    XFree(data);
    return bytes;
}

void WmCommandTest::failsWithoutADisplay()
{
    QVERIFY(!SendCommandToWM(nullptr, "VELWM_QUIT\n"));
}

void WmCommandTest::failsWithoutACommand()
{
    takeSelection();
    QVERIFY(!SendCommandToWM(m_host.get(), nullptr));
}

void WmCommandTest::failsWhenNobodyOwnsTheSelection()
{
    QVERIFY(!SendCommandToWM(m_host.get(), "VELWM_QUIT\n"));
    QVERIFY(s_hostErrors.empty());
}

void WmCommandTest::failsWhenTheOwnerIsGone()
{
    takeSelection();
    QVERIFY(SendCommandToWM(m_host.get(), "VELWM_QUIT\n"));
    m_manager.reset();
    QTRY_VERIFY(!SendCommandToWM(m_host.get(), "VELWM_QUIT\n"));
    QVERIFY(s_hostErrors.empty());
}

void WmCommandTest::appendsTheBytesToThePropertyOfTheOwner()
{
    const Window window = takeSelection();
    QVERIFY(SendCommandToWM(m_host.get(), "VELWM_UPDATE_STARTMENU\n"));
    QVERIFY(SendCommandToWM(m_host.get(), "VELWM_UPDATE_TOOLBAR\n"));
    Atom type = None;
    int format = 0;
    QCOMPARE(commands(window, &type, &format), QByteArray("VELWM_UPDATE_STARTMENU\nVELWM_UPDATE_TOOLBAR\n"));
    QCOMPARE(type, XA_STRING);
    QCOMPARE(format, 8);
}

void WmCommandTest::hasArrivedWhenTheCallReturns()
{
    const Window window = takeSelection();
    XSelectInput(m_manager.get(), window, PropertyChangeMask);
    XSync(m_manager.get(), True);
    QVERIFY(SendCommandToWM(m_host.get(), "VELWM_QUIT\n"));
    // No waiting here: the server has it already.
    XSync(m_manager.get(), False);
    XEvent event;
    QVERIFY(XCheckTypedWindowEvent(m_manager.get(), window, PropertyNotify, &event));
}

void WmCommandTest::takesALongCommand()
{
    const Window window = takeSelection();
    const QByteArray command(1000000, 'x');
    QVERIFY(SendCommandToWM(m_host.get(), command.constData()));
    Atom type = None;
    int format = 0;
    QCOMPARE(commands(window, &type, &format), command);
    // More than one request can carry is refused, not cut.
    QVERIFY(!SendCommandToWM(m_host.get(), QByteArray(20000000, 'y').constData()));
    QCOMPARE(commands(window, &type, &format), command);
}

void WmCommandTest::errorsOfItsOwnRequestsEndInTheCall()
{
    const Window window = takeSelection();
    const long number = 1;
    XChangeProperty(m_manager.get(), window, XInternAtom(m_manager.get(), "_VELWM_COMMAND", False),
                    XA_INTEGER, 32, PropModeReplace, reinterpret_cast<const unsigned char *>(&number), 1);
    XSync(m_manager.get(), False);
    // Bytes cannot be appended to numbers: the server answers with an error.
    QVERIFY(!SendCommandToWM(m_host.get(), "VELWM_QUIT\n"));
    XSync(m_host.get(), False);
    QVERIFY(s_hostErrors.empty());
}

void WmCommandTest::earlierErrorsGoToTheHandlerOfTheHost()
{
    takeSelection();
    XMapWindow(m_host.get(), 0x1ffffff); // no such window; the error is on its way
    QVERIFY(SendCommandToWM(m_host.get(), "VELWM_QUIT\n"));
    QCOMPARE(s_hostErrors.size(), std::size_t(1));
    QCOMPARE(s_hostErrors.front(), static_cast<unsigned char>(BadWindow));
}

void WmCommandTest::putsTheHandlerOfTheHostBack()
{
    SendCommandToWM(m_host.get(), "VELWM_QUIT\n");
    QVERIFY(XSetErrorHandler(hostErrorHandler) == hostErrorHandler);
    takeSelection();
    SendCommandToWM(m_host.get(), "VELWM_QUIT\n");
    QVERIFY(XSetErrorHandler(hostErrorHandler) == hostErrorHandler);
    XMapWindow(m_host.get(), 0x1ffffff);
    XSync(m_host.get(), False);
    QCOMPARE(s_hostErrors.size(), std::size_t(1));
}

void WmCommandTest::leavesTheEventsOfTheHostInTheQueue()
{
    takeSelection();
    Display *display = m_host.get();
    const Window window = XCreateSimpleWindow(display, DefaultRootWindow(display), 0, 0, 1, 1, 0, 0, 0);
    XSelectInput(display, window, PropertyChangeMask);
    XChangeProperty(display, window, XA_WM_NAME, XA_STRING, 8, PropModeReplace,
                    reinterpret_cast<const unsigned char *>("x"), 1);
    QVERIFY(SendCommandToWM(display, "VELWM_QUIT\n"));
    XEvent event;
    QVERIFY(XCheckTypedWindowEvent(display, window, PropertyNotify, &event));
}

VEL_TEST_GUILESS_MAIN(WmCommandTest)
#include "tst_wmcommand.moc"
