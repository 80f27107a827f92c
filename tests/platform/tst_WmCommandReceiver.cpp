// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <velintegration/wmcommand.h>
#include <velintegration/wmcommandreceiver.h>

#include <QSocketNotifier>

#include <atomic>
#include <memory>
#include <thread>

#include <X11/Xatom.h>
#include <X11/Xlib.h>

struct CloseDisplay
{
    void operator()(Display *display) const { XCloseDisplay(display); }
};

class WmCommandReceiverTest : public TestCase
{
    Q_OBJECT

private:
    WmCommandReceiver::LineHandler collect()
    {
        return [this](const std::string &line) { m_lines.append(QString::fromStdString(line)); };
    }
    Atom atom(const char *name) const { return XInternAtom(m_client.get(), name, False); }
    Window makeWindow() const
    {
        return XCreateSimpleWindow(m_client.get(), DefaultRootWindow(m_client.get()), 0, 0, 1, 1, 0, 0, 0);
    }
    bool ask(WmCommandReceiver &receiver, Window window, Atom target, XSelectionEvent *answer)
    {
        return ask(receiver, window, target, atom("ANSWER"), answer);
    }
    bool ask(WmCommandReceiver &receiver, Window window, Atom target, Atom property, XSelectionEvent *answer);
    QVector<unsigned long> numbers(Window window, Atom property, Atom *type);

    std::unique_ptr<Display, CloseDisplay> m_client;
    QStringList m_lines;

private Q_SLOTS:
    void init();
    void cleanup();

    void ownsNothingWithoutADisplay();
    void takesTheSelectionOfTheScreen();
    void announcesItselfToTheRootWindow();
    void callsBackWithEachLine();
    void waitsForTheEndOfALine();
    void deletesThePropertyThatItHasRead();
    void ignoresPropertiesOfAnotherType_data();
    void ignoresPropertiesOfAnotherType();
    void leavesTheSelectionToItsOwner();
    void replacesTheOwnerWhenAsked();
    void waitsUntilTheOldOwnerIsGone();
    void takesTheSelectionAgainAfterARelease();
    void handsOutWhatArrivedBeforeItLostTheSelection();
    void handsOutWhatArrivedBeforeItNoticedTheLoss();
    void forgetsHalfALineWhenItLosesTheSelection();
    void givesTheSelectionUpWhenDestroyed();
    void answersQuestionsAboutTheSelection();
    void answersWhoNamesNoProperty();
    void outlivesARequestorThatIsGone();
};

void WmCommandReceiverTest::init()
{
    TestCase::init();
    m_lines.clear();
    m_client.reset(XOpenDisplay(nullptr));
    QVERIFY(m_client);
}

void WmCommandReceiverTest::cleanup()
{
    m_client.reset();
    TestCase::cleanup();
}

void WmCommandReceiverTest::ownsNothingWithoutADisplay()
{
    WmCommandReceiver receiver(collect(), ":99999");
    QVERIFY(!receiver.acquire());
    QVERIFY(!receiver.isOwner());
    QCOMPARE(receiver.connectionFd(), -1);
    QCOMPARE(receiver.windowId(), 0ul);
    receiver.processEvents();
    receiver.release();
}

void WmCommandReceiverTest::takesTheSelectionOfTheScreen()
{
    WmCommandReceiver receiver(collect());
    QVERIFY(!receiver.isOwner());
    QVERIFY(receiver.acquire());
    QVERIFY(receiver.isOwner());
    QVERIFY(receiver.acquire()); // has it already
    QCOMPARE(XGetSelectionOwner(m_client.get(), atom("_VELWM_COMMAND_S0")), receiver.windowId());
    QVERIFY(receiver.windowId() != None);
}

void WmCommandReceiverTest::announcesItselfToTheRootWindow()
{
    XSelectInput(m_client.get(), DefaultRootWindow(m_client.get()), StructureNotifyMask);
    XSync(m_client.get(), True);
    WmCommandReceiver receiver(collect());
    QVERIFY(receiver.acquire());
    XEvent event;
    bool came = false;
    QTRY_VERIFY(came = came || XCheckTypedEvent(m_client.get(), ClientMessage, &event));
    QCOMPARE(event.xclient.message_type, atom("MANAGER"));
    QCOMPARE(event.xclient.format, 32);
    QVERIFY(event.xclient.data.l[0] != CurrentTime);
    QCOMPARE(static_cast<Atom>(event.xclient.data.l[1]), atom("_VELWM_COMMAND_S0"));
    QCOMPARE(static_cast<unsigned long>(event.xclient.data.l[2]), receiver.windowId());
    QCOMPARE(event.xclient.data.l[3], 0l);
    QCOMPARE(event.xclient.data.l[4], 0l);
}

void WmCommandReceiverTest::callsBackWithEachLine()
{
    WmCommandReceiver receiver(collect());
    QVERIFY(receiver.acquire());
    QSocketNotifier notifier(receiver.connectionFd(), QSocketNotifier::Read);
    connect(&notifier, &QSocketNotifier::activated, this, [&receiver] { receiver.processEvents(); });
    QVERIFY(SendCommandToWM(m_client.get(), "VELWM_UPDATE_STARTMENU\n"));
    QVERIFY(SendCommandToWM(m_client.get(), "VELWM_ONE and two\n\nVELWM_THREE\n"));
    const QStringList expected = {QStringLiteral("VELWM_UPDATE_STARTMENU"),
                                  QStringLiteral("VELWM_ONE and two"), QString(),
                                  QStringLiteral("VELWM_THREE")};
    QTRY_COMPARE(m_lines, expected);
    QVERIFY(SendCommandToWM(m_client.get(), "again\n"));
    QTRY_COMPARE(m_lines, expected + QStringList(QStringLiteral("again")));
}

void WmCommandReceiverTest::waitsForTheEndOfALine()
{
    WmCommandReceiver receiver(collect());
    QVERIFY(receiver.acquire());
    QVERIFY(SendCommandToWM(m_client.get(), "VELWM_"));
    receiver.processEvents();
    QCOMPARE(m_lines, QStringList());
    QVERIFY(SendCommandToWM(m_client.get(), "QUIT\nrest"));
    receiver.processEvents();
    QCOMPARE(m_lines, QStringList(QStringLiteral("VELWM_QUIT")));
}

void WmCommandReceiverTest::deletesThePropertyThatItHasRead()
{
    WmCommandReceiver receiver(collect());
    QVERIFY(receiver.acquire());
    QVERIFY(SendCommandToWM(m_client.get(), "VELWM_QUIT\n"));
    receiver.processEvents();
    Atom type = XA_STRING;
    QVERIFY(numbers(receiver.windowId(), atom("_VELWM_COMMAND"), &type).isEmpty());
    QCOMPARE(type, static_cast<Atom>(None));
    QCOMPARE(m_lines, QStringList(QStringLiteral("VELWM_QUIT")));
}

void WmCommandReceiverTest::ignoresPropertiesOfAnotherType_data()
{
    QTest::addColumn<QByteArray>("type");
    QTest::addColumn<int>("format");
    QTest::newRow("numbers") << QByteArray("INTEGER") << 32;
    QTest::newRow("wide characters") << QByteArray("STRING") << 16;
    QTest::newRow("another text") << QByteArray("UTF8_STRING") << 8;
}

void WmCommandReceiverTest::ignoresPropertiesOfAnotherType()
{
    QFETCH(QByteArray, type);
    QFETCH(int, format);
    WmCommandReceiver receiver(collect());
    QVERIFY(receiver.acquire());
    const long lineFeed = '\n';
    XChangeProperty(m_client.get(), receiver.windowId(), atom("_VELWM_COMMAND"), atom(type), format,
                    PropModeReplace, reinterpret_cast<const unsigned char *>(&lineFeed), 1);
    XSync(m_client.get(), False);
    receiver.processEvents();
    QCOMPARE(m_lines, QStringList());
    // It is out of the way of what comes next.
    QVERIFY(SendCommandToWM(m_client.get(), "VELWM_QUIT\n"));
    receiver.processEvents();
    QCOMPARE(m_lines, QStringList(QStringLiteral("VELWM_QUIT")));
}

void WmCommandReceiverTest::leavesTheSelectionToItsOwner()
{
    WmCommandReceiver first(collect());
    QVERIFY(first.acquire());
    WmCommandReceiver second(collect());
    QVERIFY(!second.acquire());
    QVERIFY(!second.isOwner());
    first.processEvents();
    QVERIFY(first.isOwner());
}

void WmCommandReceiverTest::replacesTheOwnerWhenAsked()
{
    WmCommandReceiver first(nullptr);
    bool lost = false;
    first.setLostHandler([&lost] { lost = true; });
    QVERIFY(first.acquire());
    const unsigned long window = first.windowId();
    // The old owner lets go while the new one waits for that.
    std::thread owner([&first] {
        while (first.isOwner())
            first.processEvents();
    });
    WmCommandReceiver second(collect());
    const bool acquired = second.acquire(true);
    owner.join();
    QVERIFY(acquired);
    QVERIFY(lost);
    QVERIFY(!first.isOwner());
    QCOMPARE(first.windowId(), 0ul);
    QVERIFY(window != second.windowId());
    QVERIFY(SendCommandToWM(m_client.get(), "VELWM_QUIT\n"));
    second.processEvents();
    QCOMPARE(m_lines, QStringList(QStringLiteral("VELWM_QUIT")));
}

void WmCommandReceiverTest::waitsUntilTheOldOwnerIsGone()
{
    WmCommandReceiver first(nullptr);
    QVERIFY(first.acquire());
    std::atomic<bool> isDone(false);
    std::thread newOwner([&isDone] {
        WmCommandReceiver second(nullptr);
        second.acquire(true);
        isDone = true;
    });
    const bool wasEarly = QTest::qWaitFor([&isDone] { return isDone.load(); }, 300);
    first.processEvents();
    newOwner.join();
    QVERIFY(!wasEarly);
    QVERIFY(!first.isOwner());
}

void WmCommandReceiverTest::takesTheSelectionAgainAfterARelease()
{
    WmCommandReceiver receiver(collect());
    QVERIFY(receiver.acquire());
    QVERIFY(SendCommandToWM(m_client.get(), "one\ncut"));
    receiver.release();
    QCOMPARE(m_lines, QStringList(QStringLiteral("one")));
    QVERIFY(!SendCommandToWM(m_client.get(), "nobody\n"));
    QVERIFY(receiver.acquire());
    QVERIFY(SendCommandToWM(m_client.get(), "two\n"));
    receiver.processEvents();
    QCOMPARE(m_lines, QStringList({QStringLiteral("one"), QStringLiteral("two")}));
}

void WmCommandReceiverTest::handsOutWhatArrivedBeforeItLostTheSelection()
{
    WmCommandReceiver receiver(collect());
    QVERIFY(receiver.acquire());
    QVERIFY(SendCommandToWM(m_client.get(), "VELWM_QUIT\n"));
    XSetSelectionOwner(m_client.get(), atom("_VELWM_COMMAND_S0"), makeWindow(), CurrentTime);
    XSync(m_client.get(), False);
    receiver.processEvents();
    QVERIFY(!receiver.isOwner());
    QCOMPARE(m_lines, QStringList(QStringLiteral("VELWM_QUIT")));
}

void WmCommandReceiverTest::handsOutWhatArrivedBeforeItNoticedTheLoss()
{
    WmCommandReceiver receiver(collect());
    QVERIFY(receiver.acquire());
    const Window window = receiver.windowId();
    XSetSelectionOwner(m_client.get(), atom("_VELWM_COMMAND_S0"), makeWindow(), CurrentTime);
    // Somebody had asked for the owner just before.
    XChangeProperty(m_client.get(), window, atom("_VELWM_COMMAND"), XA_STRING, 8, PropModeAppend,
                    reinterpret_cast<const unsigned char *>("VELWM_QUIT\n"), 11);
    XSync(m_client.get(), False);
    receiver.processEvents();
    QVERIFY(!receiver.isOwner());
    QCOMPARE(m_lines, QStringList(QStringLiteral("VELWM_QUIT")));
}

void WmCommandReceiverTest::forgetsHalfALineWhenItLosesTheSelection()
{
    WmCommandReceiver receiver(collect());
    QVERIFY(receiver.acquire());
    QVERIFY(SendCommandToWM(m_client.get(), "VELWM_"));
    XSetSelectionOwner(m_client.get(), atom("_VELWM_COMMAND_S0"), None, CurrentTime);
    XSync(m_client.get(), False);
    receiver.processEvents();
    QVERIFY(!receiver.isOwner());
    QVERIFY(receiver.acquire());
    QVERIFY(SendCommandToWM(m_client.get(), "QUIT\n"));
    receiver.processEvents();
    QCOMPARE(m_lines, QStringList(QStringLiteral("QUIT")));
}

void WmCommandReceiverTest::givesTheSelectionUpWhenDestroyed()
{
    {
        WmCommandReceiver receiver(collect());
        QVERIFY(receiver.acquire());
    }
    QTRY_COMPARE(XGetSelectionOwner(m_client.get(), atom("_VELWM_COMMAND_S0")), static_cast<Window>(None));
}

bool WmCommandReceiverTest::ask(WmCommandReceiver &receiver, Window window, Atom target, Atom property,
                                XSelectionEvent *answer)
{
    XConvertSelection(m_client.get(), atom("_VELWM_COMMAND_S0"), target, property, window, CurrentTime);
    XSync(m_client.get(), False);
    receiver.processEvents();
    XSync(m_client.get(), False);
    XEvent event;
    const bool came = XCheckTypedWindowEvent(m_client.get(), window, SelectionNotify, &event);
    if (came)
        *answer = event.xselection;
    return came;
}

QVector<unsigned long> WmCommandReceiverTest::numbers(Window window, Atom property, Atom *type)
{
    int format = 0;
    unsigned long count = 0;
    unsigned long left = 0;
    unsigned char *data = nullptr;
    QVector<unsigned long> result;
    XGetWindowProperty(m_client.get(), window, property, 0, 100, False, AnyPropertyType, type, &format,
                       &count, &left, &data);
    for (unsigned long i = 0; format == 32 && i < count; ++i)
        result.append(reinterpret_cast<unsigned long *>(data)[i]);
    if (data)
        XFree(data);
    return result;
}

void WmCommandReceiverTest::answersQuestionsAboutTheSelection()
{
    WmCommandReceiver receiver(collect());
    QVERIFY(receiver.acquire());
    const Window window = makeWindow();
    XSelectionEvent answer;
    Atom type = None;

    QVERIFY(ask(receiver, window, atom("UTF8_STRING"), &answer));
    QCOMPARE(answer.property, static_cast<Atom>(None));

    QVERIFY(ask(receiver, window, atom("TARGETS"), &answer));
    QCOMPARE(answer.property, atom("ANSWER"));
    QCOMPARE(numbers(window, answer.property, &type),
             QVector<unsigned long>({atom("TARGETS"), atom("MULTIPLE"), atom("TIMESTAMP")}));
    QCOMPARE(type, static_cast<Atom>(XA_ATOM));

    QVERIFY(ask(receiver, window, atom("TIMESTAMP"), &answer));
    const QVector<unsigned long> time = numbers(window, answer.property, &type);
    QCOMPARE(time.size(), 1);
    QVERIFY(time.first() != CurrentTime);
    QCOMPARE(type, static_cast<Atom>(XA_INTEGER));

    const Atom pairs[] = {atom("TIMESTAMP"), atom("FIRST"), atom("STRING"), atom("SECOND")};
    XChangeProperty(m_client.get(), window, atom("ANSWER"), atom("ATOM_PAIR"), 32, PropModeReplace,
                    reinterpret_cast<const unsigned char *>(pairs), 4);
    QVERIFY(ask(receiver, window, atom("MULTIPLE"), &answer));
    QCOMPARE(answer.property, atom("ANSWER"));
    QCOMPARE(numbers(window, atom("ANSWER"), &type),
             QVector<unsigned long>({atom("TIMESTAMP"), atom("FIRST"), atom("STRING"), None}));
    QCOMPARE(numbers(window, atom("FIRST"), &type), time);
}

void WmCommandReceiverTest::answersWhoNamesNoProperty()
{
    WmCommandReceiver receiver(collect());
    QVERIFY(receiver.acquire());
    const Window window = makeWindow();
    XSelectionEvent answer;
    QVERIFY(ask(receiver, window, atom("TIMESTAMP"), None, &answer));
    QCOMPARE(answer.property, atom("TIMESTAMP"));
    Atom type = None;
    QCOMPARE(numbers(window, answer.property, &type).size(), 1);
}

void WmCommandReceiverTest::outlivesARequestorThatIsGone()
{
    WmCommandReceiver receiver(collect());
    QVERIFY(receiver.acquire());
    const Window window = makeWindow();
    XConvertSelection(m_client.get(), atom("_VELWM_COMMAND_S0"), atom("TARGETS"), atom("ANSWER"), window,
                      CurrentTime);
    XDestroyWindow(m_client.get(), window);
    XSync(m_client.get(), False);
    // The error handler of Xlib would end the program.
    receiver.processEvents();
    QVERIFY(receiver.isOwner());
}

VEL_TEST_GUILESS_MAIN(WmCommandReceiverTest)
#include "tst_WmCommandReceiver.moc"
