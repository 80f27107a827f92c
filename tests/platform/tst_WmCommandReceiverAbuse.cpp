// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// Clients that send too much, half of it, or what only the server may tell.

#include "TestCase.h"

#include <velintegration/wmcommand.h>
#include <velintegration/wmcommandreceiver.h>

#include <QElapsedTimer>

#include <atomic>
#include <memory>
#include <thread>

#include <X11/Xatom.h>
#include <X11/Xlib.h>

struct CloseDisplay
{
    void operator()(Display *display) const { XCloseDisplay(display); }
};
using DisplayPointer = std::unique_ptr<Display, CloseDisplay>;

namespace {

int ignoreErrors(Display *, XErrorEvent *)
{
    return 0;
}

// Destroys every window that anybody makes, until it is told to stop.
void destroyNewWindows(const std::atomic<bool> &stop, std::atomic<bool> &isReady)
{
    const DisplayPointer display(XOpenDisplay(nullptr));
    XSelectInput(display.get(), DefaultRootWindow(display.get()), SubstructureNotifyMask);
    XSync(display.get(), False);
    isReady = true;
    while (!stop) {
        while (XPending(display.get()) > 0) {
            XEvent event;
            XNextEvent(display.get(), &event);
            if (event.type == CreateNotify) {
                XDestroyWindow(display.get(), event.xcreatewindow.window);
                XFlush(display.get());
            }
        }
    }
}

} // namespace

class WmCommandReceiverAbuseTest : public TestCase
{
    Q_OBJECT

private:
    Atom atom(const char *name) const { return XInternAtom(m_client.get(), name, False); }
    Window owner() const { return XGetSelectionOwner(m_client.get(), atom("_VELWM_COMMAND_S0")); }
    bool send(const QByteArray &bytes) const { return SendCommandToWM(m_client.get(), bytes.constData()); }
    QByteArrayList linesOf(const QByteArray &bytes);
    void sendEvent(int type, Window window);
    void letASecondPass();

    DisplayPointer m_client;
    QByteArrayList m_lines;
    int m_lost = 0;
    std::unique_ptr<WmCommandReceiver> m_receiver;

private Q_SLOTS:
    void init();
    void cleanup();

    void handsOutAMebibyteOfLineFeedsInTime();
    void handsOutAnyNumberOfPiecesInTime();
    void handsOutEachOfEqualLines();
    void handsOutInOrderWhatIsReadInManyChunks();
    void dropsALineThatIsTooLong_data();
    void dropsALineThatIsTooLong();
    void dropsHalfALineThatNothingFollows_data();
    void dropsHalfALineThatNothingFollows();
    void keepsHalfALineWhileItIsReadLate();
    void makesAnewAWindowThatOthersDestroyed();
    void readsNoWindowThatOthersDestroyed();
    void releasesAWindowThatOthersDestroyed();
    void leavesTheSelectionToASuccessorThatDestroyedTheWindow();
    void believesNoSentEvent_data();
    void believesNoSentEvent();
    void believesNoSentLossOfADestroyedWindow();
    void keepsAWindowThatAnotherClientClaims();
    void endsAFightForItsWindow();
};

void WmCommandReceiverAbuseTest::init()
{
    TestCase::init();
    m_lines.clear();
    m_lost = 0;
    m_client.reset(XOpenDisplay(nullptr));
    QVERIFY(m_client);
    m_receiver = std::make_unique<WmCommandReceiver>(
        [this](const std::string &line) { m_lines.append(QByteArray::fromStdString(line)); });
    m_receiver->setLostHandler([this] { ++m_lost; });
    QVERIFY(m_receiver->acquire());
}

void WmCommandReceiverAbuseTest::cleanup()
{
    m_receiver.reset();
    m_client.reset();
    TestCase::cleanup();
}

// The lines that the receiver hands out when \a bytes are sent.
QByteArrayList WmCommandReceiverAbuseTest::linesOf(const QByteArray &bytes)
{
    m_lines.clear();
    if (!send(bytes))
        QTest::qFail("cannot send", __FILE__, __LINE__);
    m_receiver->processEvents();
    return m_lines;
}

void WmCommandReceiverAbuseTest::sendEvent(int type, Window window)
{
    XEvent event = {};
    event.type = type;
    if (type == SelectionClear) {
        event.xselectionclear.window = window;
        event.xselectionclear.selection = atom("_VELWM_COMMAND_S0");
    } else if (type == DestroyNotify) {
        event.xdestroywindow.event = window;
        event.xdestroywindow.window = window;
    } else {
        event.xproperty.window = window;
        event.xproperty.atom = atom("_VELWM_COMMAND");
        event.xproperty.state = PropertyNewValue;
        event.xproperty.time = 0x7fffffff;
    }
    XSendEvent(m_client.get(), window, False, NoEventMask, &event);
    XSync(m_client.get(), False);
}

void WmCommandReceiverAbuseTest::letASecondPass()
{
    QElapsedTimer timer;
    timer.start();
    QTRY_VERIFY(timer.elapsed() > 1200);
}

void WmCommandReceiverAbuseTest::handsOutAMebibyteOfLineFeedsInTime()
{
    QElapsedTimer timer;
    timer.start();
    const QByteArrayList lines = linesOf(QByteArray(1 << 20, '\n'));
    QVERIFY2(timer.elapsed() < 2000, QByteArray::number(timer.elapsed()).constData());
    QCOMPARE(lines.size(), 1 << 20);
    QCOMPARE(lines.count(QByteArray()), 1 << 20);
}

void WmCommandReceiverAbuseTest::handsOutAnyNumberOfPiecesInTime()
{
    const Atom property = atom("_VELWM_COMMAND");
    for (int i = 0; i < 20000; ++i)
        XChangeProperty(m_client.get(), owner(), property, XA_STRING, 8, PropModeAppend,
                        reinterpret_cast<const unsigned char *>("x\n"), 2);
    XSync(m_client.get(), False);
    QElapsedTimer timer;
    timer.start();
    m_receiver->processEvents();
    QVERIFY2(timer.elapsed() < 2000, QByteArray::number(timer.elapsed()).constData());
    QCOMPARE(m_lines.size(), 20000);
}

void WmCommandReceiverAbuseTest::handsOutEachOfEqualLines()
{
    const QByteArray line("VELWM_UPDATE_STARTMENU\n");
    QCOMPARE(linesOf(line.repeated(1000)).count(line.trimmed()), 1000);
}

void WmCommandReceiverAbuseTest::handsOutInOrderWhatIsReadInManyChunks()
{
    QByteArrayList expected;
    for (int i = 0; i < 300000; ++i)
        expected.append(QByteArray::number(i));
    QVERIFY(linesOf(expected.join('\n') + '\n') == expected);
    QCOMPARE(linesOf("again\n"), QByteArrayList{"again"});
}

void WmCommandReceiverAbuseTest::dropsALineThatIsTooLong_data()
{
    QTest::addColumn<QByteArrayList>("pieces");
    QTest::addColumn<QByteArrayList>("expected");
    const QByteArray longest(4096, 'x');
    const QByteArray mebibyte(1 << 20, 'x');
    QTest::newRow("longest") << QByteArrayList({longest + "\nb\n"}) << QByteArrayList({longest, "b"});
    QTest::newRow("one more") << QByteArrayList({"a\nx" + longest + "\nb\n"}) << QByteArrayList({"a", "b"});
    QTest::newRow("in pieces") << QByteArrayList({longest, "x", longest, "y\nb\n"}) << QByteArrayList{"b"};
    QTest::newRow("end by itself") << QByteArrayList({mebibyte, mebibyte, "\n", "b\n"})
                                   << QByteArrayList{"b"};
    QTest::newRow("longest in pieces") << QByteArrayList({longest, "\n"}) << QByteArrayList{longest};
}

void WmCommandReceiverAbuseTest::dropsALineThatIsTooLong()
{
    QFETCH(QByteArrayList, pieces);
    QFETCH(QByteArrayList, expected);
    for (const QByteArray &piece : pieces) {
        QVERIFY(send(piece));
        m_receiver->processEvents();
    }
    QCOMPARE(m_lines, expected);
}

void WmCommandReceiverAbuseTest::dropsHalfALineThatNothingFollows_data()
{
    QTest::addColumn<QByteArray>("half");
    QTest::newRow("short") << QByteArray("VELWM_");
    QTest::newRow("too long") << QByteArray(5000, 'x');
}

void WmCommandReceiverAbuseTest::dropsHalfALineThatNothingFollows()
{
    QFETCH(QByteArray, half);
    {
        const DisplayPointer dying(XOpenDisplay(nullptr));
        QVERIFY(SendCommandToWM(dying.get(), half.constData()));
    }
    m_receiver->processEvents();
    letASecondPass();
    QCOMPARE(linesOf("VELWM_QUIT\n"), QByteArrayList{"VELWM_QUIT"});
}

void WmCommandReceiverAbuseTest::keepsHalfALineWhileItIsReadLate()
{
    QVERIFY(send("VELWM_"));
    m_receiver->processEvents();
    QVERIFY(send("QUIT\n"));
    letASecondPass();
    m_receiver->processEvents();
    QCOMPARE(m_lines, QByteArrayList{"VELWM_QUIT"});
}

void WmCommandReceiverAbuseTest::makesAnewAWindowThatOthersDestroyed()
{
    const Window window = m_receiver->windowId();
    QVERIFY(send("half"));
    XDestroyWindow(m_client.get(), window);
    XSync(m_client.get(), False);
    m_receiver->processEvents();
    QVERIFY(m_receiver->isOwner());
    QVERIFY(m_receiver->windowId() != window);
    QCOMPARE(owner(), m_receiver->windowId());
    QCOMPARE(m_lost, 0);
    QCOMPARE(linesOf("VELWM_QUIT\n"), QByteArrayList{"VELWM_QUIT"});
}

void WmCommandReceiverAbuseTest::readsNoWindowThatOthersDestroyed()
{
    const Window window = m_receiver->windowId();
    QVERIFY(send("VELWM_QUIT\n"));
    // The error handler of Xlib would end the program.
    XConvertSelection(m_client.get(), atom("_VELWM_COMMAND_S0"), atom("TARGETS"), atom("ANSWER"), window,
                      CurrentTime);
    XDestroyWindow(m_client.get(), window);
    XSync(m_client.get(), False);
    m_receiver->processEvents();
    QVERIFY(m_receiver->isOwner());
}

void WmCommandReceiverAbuseTest::releasesAWindowThatOthersDestroyed()
{
    XDestroyWindow(m_client.get(), m_receiver->windowId());
    XSync(m_client.get(), False);
    m_receiver->release();
    QVERIFY(!m_receiver->isOwner());
    QVERIFY(m_receiver->acquire());
    QCOMPARE(owner(), m_receiver->windowId());
}

void WmCommandReceiverAbuseTest::leavesTheSelectionToASuccessorThatDestroyedTheWindow()
{
    const Window successor =
        XCreateSimpleWindow(m_client.get(), DefaultRootWindow(m_client.get()), 0, 0, 1, 1, 0, 0, 0);
    XDestroyWindow(m_client.get(), m_receiver->windowId());
    XSetSelectionOwner(m_client.get(), atom("_VELWM_COMMAND_S0"), successor, CurrentTime);
    XSync(m_client.get(), False);
    m_receiver->processEvents();
    QVERIFY(!m_receiver->isOwner());
    QCOMPARE(m_lost, 1);
    QCOMPARE(owner(), successor);
}

void WmCommandReceiverAbuseTest::believesNoSentEvent_data()
{
    QTest::addColumn<int>("type");
    QTest::newRow("loss") << int(SelectionClear);
    QTest::newRow("destruction") << int(DestroyNotify);
    QTest::newRow("change") << int(PropertyNotify);
}

void WmCommandReceiverAbuseTest::believesNoSentEvent()
{
    QFETCH(int, type);
    const Window window = m_receiver->windowId();
    QVERIFY(send("VELWM_"));
    m_receiver->processEvents();
    sendEvent(type, window);
    m_receiver->processEvents();
    QVERIFY(m_receiver->isOwner());
    QCOMPARE(m_receiver->windowId(), window);
    QCOMPARE(m_lost, 0);
    QCOMPARE(linesOf("QUIT\n"), QByteArrayList{"VELWM_QUIT"});
}

void WmCommandReceiverAbuseTest::believesNoSentLossOfADestroyedWindow()
{
    sendEvent(SelectionClear, m_receiver->windowId());
    XDestroyWindow(m_client.get(), m_receiver->windowId());
    XSync(m_client.get(), False);
    m_receiver->processEvents();
    QVERIFY(m_receiver->isOwner());
    QCOMPARE(owner(), m_receiver->windowId());
    QCOMPARE(m_lost, 0);
}

void WmCommandReceiverAbuseTest::keepsAWindowThatAnotherClientClaims()
{
    const Window window = m_receiver->windowId();
    {
        const DisplayPointer other(XOpenDisplay(nullptr));
        XSetSelectionOwner(other.get(), XInternAtom(other.get(), "_VELWM_COMMAND_S0", False), window,
                           CurrentTime);
        XSync(other.get(), False);
        m_receiver->processEvents();
    }
    QCOMPARE(linesOf("VELWM_QUIT\n"), QByteArrayList{"VELWM_QUIT"});
    QCOMPARE(owner(), window);
    QCOMPARE(m_lost, 0);
}

void WmCommandReceiverAbuseTest::endsAFightForItsWindow()
{
    const XErrorHandler before = XSetErrorHandler(ignoreErrors);
    std::atomic<bool> stop(false);
    std::atomic<bool> isReady(false);
    std::thread destroyer([&stop, &isReady] { destroyNewWindows(stop, isReady); });
    const bool began = QTest::qWaitFor([&isReady] { return isReady.load(); });
    XDestroyWindow(m_client.get(), m_receiver->windowId());
    XSync(m_client.get(), False);
    // Nothing but that these calls come back, and one of them tells the loss when there is one.
    for (int i = 0; i < 10 && m_receiver->isOwner(); ++i)
        m_receiver->processEvents();
    stop = true;
    destroyer.join();
    XSetErrorHandler(before);
    QVERIFY(began);
    m_receiver->processEvents();
    QCOMPARE(m_receiver->isOwner(), m_lost == 0);
    QCOMPARE(owner(), m_receiver->windowId());
}

VEL_TEST_GUILESS_MAIN(WmCommandReceiverAbuseTest)
#include "tst_WmCommandReceiverAbuse.moc"
