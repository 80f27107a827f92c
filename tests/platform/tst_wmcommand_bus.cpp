// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <velintegration/wmcommand.h>
#include <velintegration/wmcommandreceiver.h>

#include <QProcess>
#include <QSocketNotifier>

#include <X11/Xlib.h>

/// The channel over the session bus, which serves where there is no X display, and beside one.
class tst_wmcommand_bus : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();
    void failsWithoutABus_data();
    void failsWithoutABus();
    void failsWhenNobodyHasTheName();
    void failsWithoutACommand();
    void refusesWhatIsNoUtf8();
    void handsOutEachLine_data();
    void handsOutEachLine();
    void joinsNoTwoMessages();
    void takesAsManyAsAreSent();
    void takesNoCommandFromAnythingElse();
    void wakesTheReceiverUp();
    void leavesTheNameToWhoHasIt();
    void takesTheNameFromWhoHasIt();
    void freesTheNameWhenItIsReleased();
    void tellsThatTheBusIsGone();
    void findsTheBusOfTheSessionByItsSocket();
    void servesADisplayAndTheBus();
    void keepsTheDisplayWhenAnotherHasTheBus();
    void functionsWorkWithoutADisplay();
    void theBridgeWorksWithoutADisplay();

private:
    void startBus(const QStringList &arguments = {});
    bool send(const char *command) const { return SendCommandToWM(nullptr, command); }
    static QString program(const char *name)
    {
        return QCoreApplication::applicationDirPath() + QStringLiteral("/../bin/") + QLatin1String(name);
    }

    QByteArray m_display;
    QScopedPointer<QProcess> m_bus;
};

namespace {

/// A receiver and what it was told.
class Receiver
{
public:
    Receiver()
        : m_receiver([this](const std::string &line) { m_lines.append(QByteArray::fromStdString(line)); })
    {
        m_receiver.setLostHandler([this] { m_isLost = true; });
    }
    WmCommandReceiver *operator->() { return &m_receiver; }
    QByteArrayList lines()
    {
        m_receiver.processEvents();
        return m_lines;
    }
    bool isLost()
    {
        m_receiver.processEvents();
        return m_isLost;
    }

private:
    QByteArrayList m_lines;
    bool m_isLost = false;
    WmCommandReceiver m_receiver;
};

} // namespace

void tst_wmcommand_bus::init()
{
    TestCase::init();
    m_display = qgetenv("DISPLAY");
    qunsetenv("DISPLAY");
    startBus();
}

void tst_wmcommand_bus::cleanup()
{
    qputenv("DISPLAY", m_display);
    qunsetenv("DBUS_SESSION_BUS_ADDRESS");
    m_bus->kill();
    m_bus->waitForFinished();
    TestCase::cleanup();
}

void tst_wmcommand_bus::startBus(const QStringList &arguments)
{
    m_bus.reset(new QProcess);
    m_bus->start(QStringLiteral("dbus-daemon"),
                 QStringList{QStringLiteral("--session"), QStringLiteral("--nofork"),
                             QStringLiteral("--nopidfile"), QStringLiteral("--print-address=1")}
                     + arguments);
    QByteArray address;
    while (!address.endsWith('\n') && m_bus->waitForReadyRead(10000))
        address += m_bus->readAllStandardOutput();
    QVERIFY(address.endsWith('\n'));
    qputenv("DBUS_SESSION_BUS_ADDRESS", address.trimmed());
}

void tst_wmcommand_bus::failsWithoutABus_data()
{
    QTest::addColumn<QByteArray>("address");
    QTest::newRow("none") << QByteArray();
    QTest::newRow("nothing there") << QByteArray("unix:path=/nowhere/at/all");
    QTest::newRow("garbage") << QByteArray("garbage");
}

void tst_wmcommand_bus::failsWithoutABus()
{
    QFETCH(QByteArray, address);
    qputenv("DBUS_SESSION_BUS_ADDRESS", address);
    QVERIFY(!send("VELWM_A\n"));
    Receiver receiver;
    QVERIFY(!receiver->acquire());
    QVERIFY(!receiver->isOwner());
    QCOMPARE(receiver->connectionFd(), -1);
    receiver->processEvents();
    receiver->release();
}

void tst_wmcommand_bus::failsWhenNobodyHasTheName()
{
    Receiver receiver;
    QVERIFY(!send("VELWM_A\n"));
}

void tst_wmcommand_bus::failsWithoutACommand()
{
    Receiver receiver;
    QVERIFY(receiver->acquire());
    QVERIFY(!send(nullptr));
}

void tst_wmcommand_bus::refusesWhatIsNoUtf8()
{
    Receiver receiver;
    QVERIFY(receiver->acquire());
    QVERIFY(!send("VELWM_\xff\n"));
    QVERIFY(send("VELWM_\xc3\x9c\n"));
    QTRY_COMPARE_WITH_TIMEOUT(receiver.lines(), QByteArrayList({"VELWM_\xc3\x9c"}), 20000);
}

void tst_wmcommand_bus::handsOutEachLine_data()
{
    QTest::addColumn<QByteArray>("command");
    QTest::addColumn<QByteArrayList>("lines");
    const QByteArray longest(int(VelWmCommand::LongestLine), 'x');
    QTest::newRow("one") << QByteArray("VELWM_A b\n") << QByteArrayList{"VELWM_A b"};
    QTest::newRow("two") << QByteArray("VELWM_A\nVELWM_A\n") << QByteArrayList{"VELWM_A", "VELWM_A"};
    QTest::newRow("an empty one") << QByteArray("\n") << QByteArrayList{""};
    QTest::newRow("none") << QByteArray("") << QByteArrayList{};
    QTest::newRow("without an end") << QByteArray("VELWM_A\nVELWM_B") << QByteArrayList{"VELWM_A"};
    QTest::newRow("the longest") << longest + '\n' << QByteArrayList{longest};
    QTest::newRow("too long") << longest + "x\nVELWM_B\n" << QByteArrayList{"VELWM_B"};
}

void tst_wmcommand_bus::handsOutEachLine()
{
    QFETCH(QByteArray, command);
    QFETCH(QByteArrayList, lines);
    Receiver receiver;
    QVERIFY(receiver->acquire());
    QVERIFY(receiver->isOwner());
    QVERIFY(send(command.constData()));
    QVERIFY(send("VELWM_LAST\n"));
    QTRY_COMPARE_WITH_TIMEOUT(receiver.lines(), lines + QByteArrayList({"VELWM_LAST"}), 20000);
}

void tst_wmcommand_bus::joinsNoTwoMessages()
{
    Receiver receiver;
    QVERIFY(receiver->acquire());
    QVERIFY(send("VELWM_A"));
    QVERIFY(send("B\n"));
    QTRY_COMPARE_WITH_TIMEOUT(receiver.lines(), QByteArrayList({"B"}), 20000);
}

void tst_wmcommand_bus::takesAsManyAsAreSent()
{
    Receiver receiver;
    QVERIFY(receiver->acquire());
    QByteArray all;
    QByteArrayList lines;
    for (int i = 0; i < 100000; ++i) {
        lines.append("VELWM_" + QByteArray::number(i));
        all += lines.constLast() + '\n';
    }
    QVERIFY(send(all.constData()));
    for (int i = 0; i < 200; ++i) {
        lines.append("VELWM_AGAIN");
        QVERIFY(send("VELWM_AGAIN\n"));
    }
    QTRY_COMPARE_WITH_TIMEOUT(receiver.lines().size(), lines.size(), 20000);
    QCOMPARE(receiver.lines(), lines);
}

void tst_wmcommand_bus::takesNoCommandFromAnythingElse()
{
    Receiver receiver;
    QVERIFY(receiver->acquire());
    const QString name = QString::fromLatin1(VelWmCommand::busName);
    QProcess caller;
    const auto call = [&](const QString &method, const QString &argument) {
        caller.start(QStringLiteral("dbus-send"),
                     {QStringLiteral("--session"), QStringLiteral("--print-reply"),
                      QStringLiteral("--dest=") + name, QString::fromLatin1(VelWmCommand::busPath),
                      name + QLatin1Char('.') + method, argument});
        while (caller.state() != QProcess::NotRunning) {
            receiver->processEvents();
            caller.waitForFinished(10);
        }
        return caller.exitCode();
    };
    QVERIFY(call(QStringLiteral("Quit"), QStringLiteral("string:VELWM_A\n")) != 0);
    QVERIFY(call(QStringLiteral("Command"), QStringLiteral("int32:7")) != 0);
    QCOMPARE(receiver.lines(), QByteArrayList());
    QCOMPARE(call(QStringLiteral("Command"), QStringLiteral("string:VELWM_B\n")), 0);
    QCOMPARE(receiver.lines(), QByteArrayList({"VELWM_B"}));
}

void tst_wmcommand_bus::wakesTheReceiverUp()
{
    Receiver receiver;
    QVERIFY(receiver->acquire());
    QSocketNotifier notifier(receiver->connectionFd(), QSocketNotifier::Read);
    QByteArrayList lines;
    connect(&notifier, &QSocketNotifier::activated, this, [&] { lines = receiver.lines(); });
    QVERIFY(send("VELWM_A\n"));
    QTRY_COMPARE_WITH_TIMEOUT(lines, QByteArrayList({"VELWM_A"}), 20000);
}

void tst_wmcommand_bus::leavesTheNameToWhoHasIt()
{
    Receiver first;
    Receiver second;
    QVERIFY(first->acquire());
    QVERIFY(!second->acquire());
    QVERIFY(!second->isOwner());
    QVERIFY(send("VELWM_A\n"));
    QTRY_COMPARE_WITH_TIMEOUT(first.lines(), QByteArrayList({"VELWM_A"}), 20000);
    QVERIFY(!first.isLost());
    QCOMPARE(second.lines(), QByteArrayList());
}

void tst_wmcommand_bus::takesTheNameFromWhoHasIt()
{
    Receiver first;
    Receiver second;
    QVERIFY(first->acquire());
    QVERIFY(send("VELWM_A\n"));
    QVERIFY(second->acquire(true));
    QTRY_VERIFY_WITH_TIMEOUT(first.isLost(), 20000);
    QVERIFY(!first->isOwner());
    QCOMPARE(first.lines(), QByteArrayList({"VELWM_A"}));
    QVERIFY(send("VELWM_B\n"));
    QTRY_COMPARE_WITH_TIMEOUT(second.lines(), QByteArrayList({"VELWM_B"}), 20000);
    QVERIFY(first->acquire(true));
    QTRY_VERIFY_WITH_TIMEOUT(second.isLost(), 20000);
}

void tst_wmcommand_bus::freesTheNameWhenItIsReleased()
{
    Receiver first;
    Receiver second;
    QVERIFY(first->acquire());
    QVERIFY(send("VELWM_A\n"));
    first->release();
    QVERIFY(!first->isOwner());
    QCOMPARE(first.lines(), QByteArrayList({"VELWM_A"}));
    QVERIFY(!send("VELWM_B\n"));
    QVERIFY(second->acquire());
    QVERIFY(!first.isLost());
}

void tst_wmcommand_bus::tellsThatTheBusIsGone()
{
    Receiver receiver;
    QVERIFY(receiver->acquire());
    m_bus->kill();
    QVERIFY(m_bus->waitForFinished());
    QTRY_VERIFY_WITH_TIMEOUT(receiver.isLost(), 20000);
    QVERIFY(!receiver->isOwner());
    QVERIFY(!receiver->acquire());
    QVERIFY(!send("VELWM_A\n"));
}

void tst_wmcommand_bus::findsTheBusOfTheSessionByItsSocket()
{
    m_bus->kill();
    m_bus->waitForFinished();
    const QByteArray socket = qgetenv("XDG_RUNTIME_DIR") + "/bus";
    startBus({QStringLiteral("--address=unix:path=") + QFile::decodeName(socket)});
    qunsetenv("DBUS_SESSION_BUS_ADDRESS");
    Receiver receiver;
    const bool isFound = receiver->acquire() && send("VELWM_A\n");
    QFile::remove(QFile::decodeName(socket));
    QVERIFY(isFound);
}

void tst_wmcommand_bus::servesADisplayAndTheBus()
{
    qputenv("DISPLAY", m_display);
    Receiver receiver;
    QVERIFY(receiver->acquire());
    QVERIFY(receiver->windowId() != 0);
    QSocketNotifier notifier(receiver->connectionFd(), QSocketNotifier::Read);
    QByteArrayList lines;
    connect(&notifier, &QSocketNotifier::activated, this, [&] { lines = receiver.lines(); });
    QVERIFY(send("VELWM_BUS\n"));
    QTRY_COMPARE_WITH_TIMEOUT(lines, QByteArrayList({"VELWM_BUS"}), 20000);
    Display *display = XOpenDisplay(nullptr);
    const bool isSent = SendCommandToWM(display, "VELWM_X\n");
    XCloseDisplay(display);
    QVERIFY(isSent);
    QTRY_COMPARE_WITH_TIMEOUT(lines, QByteArrayList({"VELWM_BUS", "VELWM_X"}), 20000);
}

void tst_wmcommand_bus::keepsTheDisplayWhenAnotherHasTheBus()
{
    Receiver other;
    QVERIFY(other->acquire());
    qputenv("DISPLAY", m_display);
    Receiver receiver;
    QVERIFY(receiver->acquire());
    QVERIFY(receiver->acquire(true));
    QTRY_VERIFY_WITH_TIMEOUT(other.isLost(), 20000);
    QVERIFY(other->acquire(true));
    QVERIFY(!receiver.isLost());
    QVERIFY(receiver->isOwner());
}

void tst_wmcommand_bus::functionsWorkWithoutADisplay()
{
    QProcess function;
    function.start(program("vel-wmfunc"), {QStringLiteral("VELWM_A"), QStringLiteral("b")});
    QVERIFY(function.waitForFinished());
    QCOMPARE(function.exitCode(), 1);
    QCOMPARE(function.readAllStandardError().count('\n'), 1);
    Receiver receiver;
    QVERIFY(receiver->acquire());
    function.start(program("vel-wmfunc"), {QStringLiteral("VELWM_A"), QStringLiteral("b")});
    QVERIFY(function.waitForFinished());
    QCOMPARE(function.exitCode(), 0);
    QTRY_COMPARE_WITH_TIMEOUT(receiver.lines(), QByteArrayList({"VELWM_A b"}), 20000);
}

void tst_wmcommand_bus::theBridgeWorksWithoutADisplay()
{
    QProcess bridge;
    const QString said = path(QStringLiteral("said"));
    bridge.start(program("vel-wmbridge"),
                 {QStringLiteral("--startmenu"),
                  QStringLiteral("printf '%s\\n' \"$VEL_COMMAND\" >> '") + said + QLatin1Char('\'')});
    QVERIFY(bridge.waitForStarted());
    QTRY_VERIFY_WITH_TIMEOUT(send("VELWM_UPDATE_STARTMENU\n"), 20000);
    QTRY_VERIFY_WITH_TIMEOUT(QFile::exists(said) && read(said).startsWith("VELWM_UPDATE_STARTMENU\n"), 20000);
    bridge.terminate();
    QVERIFY(bridge.waitForFinished());
    QCOMPARE(bridge.exitCode(), 0);
    QVERIFY(!send("VELWM_UPDATE_STARTMENU\n"));
}

VEL_TEST_GUILESS_MAIN(tst_wmcommand_bus)
#include "tst_wmcommand_bus.moc"
