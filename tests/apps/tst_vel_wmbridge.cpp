// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <velintegration/wmcommand.h>
#include <velintegration/wmcommandreceiver.h>

#include <QFile>
#include <QProcess>

#include <memory>

#include <X11/Xlib.h>

#include <signal.h>

namespace {

struct CloseDisplay
{
    void operator()(Display *display) const { XCloseDisplay(display); }
};
using DisplayPointer = std::unique_ptr<Display, CloseDisplay>;

bool send(const char *command)
{
    Display *display = XOpenDisplay(nullptr);
    if (!display)
        return false;
    const bool sent = SendCommandToWM(display, command);
    XCloseDisplay(display);
    return sent;
}

} // namespace

class tst_vel_wmbridge : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void cleanup();

    void runsACommandForEachKindOfLine_data();
    void runsACommandForEachKindOfLine();
    void ignoresLinesWithoutACommand();
    void leavesTheChannelToItsOwner();
    void takesTheChannelWhenToldTo();
    void endsWhenTheChannelIsTaken();
    void givesTheChannelUpOnTermination();
    void endsWithoutADisplay();
    void runsCommandsWithoutItsOwnFiles();
    void mergesEqualLinesThatWait();
    void runsOtherCommandsBesideOneThatStays();
    void runsFewCommandsAtATime();
    void tellsOnceThatTooManyLinesWait();
    void leavesItsCommandsRunningWhenItEnds();
    void keepsTheChannelWhenOthersDestroyItsWindow();
    void keepsTheChannelWhenALossIsOnlySent();
    void doesWhatAWindowManagerNeeds_data();
    void doesWhatAWindowManagerNeeds();
    void prefersTheCommandThatIsGiven();
    void preparesTheMenuOfFluxboxAtTheStart();
    void refusesUnknownArguments_data();
    void refusesUnknownArguments();

private:
    void start(const QStringList &arguments);
    /// Puts a program \a name into the PATH of the bridge.
    void provide(const char *name, const QString &commands);
    QString log() const { return path(QStringLiteral("log")); }
    QString logging(const char *word) const
    {
        return QStringLiteral("echo %1 \"$VEL_COMMAND\" >> '%2'").arg(QLatin1String(word), log());
    }
    // Logs its start and, once the gate is open, its end.
    QString waiting(const char *word) const
    {
        return QStringLiteral("[ \"$VEL_COMMAND\" = VELWM_PING ] && exit; %1; "
                              "until [ -e '%2/gate' ] || [ ! -d '%2' ]; do sleep 0.02; done; %3")
            .arg(logging(word), folder(), logging("end"));
    }
    void openGate() { write(QStringLiteral("gate"), QByteArray()); }
    QByteArrayList logged() const
    {
        QByteArrayList lines = QFile::exists(log()) ? read(log()).split('\n') : QByteArrayList();
        lines.removeAll(QByteArray());
        return lines;
    }
    static Window owner(Display *display)
    {
        return XGetSelectionOwner(display, XInternAtom(display, "_VELWM_COMMAND_S0", False));
    }

    QProcess m_bridge;
};

void tst_vel_wmbridge::start(const QStringList &arguments)
{
    m_bridge.start(QStringLiteral(VEL_PROGRAM), arguments);
    QVERIFY(m_bridge.waitForStarted());
    QTRY_VERIFY(send("VELWM_PING\n") || m_bridge.state() == QProcess::NotRunning);
}

void tst_vel_wmbridge::cleanup()
{
    if (m_bridge.state() != QProcess::NotRunning) {
        m_bridge.terminate();
        QVERIFY(m_bridge.waitForFinished());
    }
    m_bridge.readAll();
    m_bridge.readAllStandardError();
    m_bridge.setProcessEnvironment(QProcessEnvironment::systemEnvironment());
    TestCase::cleanup();
}

void tst_vel_wmbridge::runsACommandForEachKindOfLine_data()
{
    QTest::addColumn<QByteArray>("line");
    QTest::addColumn<QByteArray>("logged");

    QTest::newRow("start menu") << QByteArray("VELWM_UPDATE_STARTMENU\n")
                                << QByteArray("menu VELWM_UPDATE_STARTMENU\n");
    QTest::newRow("tool bar") << QByteArray("VELWM_UPDATE_TOOLBAR\n")
                              << QByteArray("bar VELWM_UPDATE_TOOLBAR\n");
    QTest::newRow("desktop") << QByteArray("VELWM_UPDATE_SHORTCUT\n")
                             << QByteArray("desk VELWM_UPDATE_SHORTCUT\n");
    QTest::newRow("other") << QByteArray("VELWM_RAISE a; $(b) 'c'\n")
                           << QByteArray("other VELWM_RAISE a; $(b) 'c'\n");
}

void tst_vel_wmbridge::runsACommandForEachKindOfLine()
{
    QFETCH(QByteArray, line);
    QFETCH(QByteArray, logged);
    start({QStringLiteral("--startmenu"), logging("menu"), QStringLiteral("--toolbar"), logging("bar"),
           QStringLiteral("--shortcut"), logging("desk"), QStringLiteral("--other"), logging("other")});

    QVERIFY(send(line));
    QTRY_VERIFY(QFile::exists(log()) && read(log()).contains(logged));
}

void tst_vel_wmbridge::ignoresLinesWithoutACommand()
{
    start({QStringLiteral("--toolbar"), logging("bar")});

    QVERIFY(send("VELWM_UPDATE_STARTMENU\nVELWM_UPDATE_TOOLBAR\n"));
    QTRY_VERIFY(QFile::exists(log()));
    QTRY_COMPARE(read(log()), QByteArray("bar VELWM_UPDATE_TOOLBAR\n"));
}

void tst_vel_wmbridge::leavesTheChannelToItsOwner()
{
    WmCommandReceiver owner([](const std::string &) {});
    QVERIFY(owner.acquire());

    m_bridge.start(QStringLiteral(VEL_PROGRAM), QStringList());
    QVERIFY(m_bridge.waitForFinished());
    QCOMPARE(m_bridge.exitCode(), 1);
    QCOMPARE(m_bridge.readAllStandardError(),
             QByteArray(
                 "vel-wmbridge: cannot take the channel: there is no display, or another program has it\n"));
    QVERIFY(owner.isOwner());
}

void tst_vel_wmbridge::takesTheChannelWhenToldTo()
{
    bool lost = false;
    WmCommandReceiver owner([](const std::string &) {});
    owner.setLostHandler([&lost] { lost = true; });
    QVERIFY(owner.acquire());

    m_bridge.start(QStringLiteral(VEL_PROGRAM),
                   {QStringLiteral("--replace"), QStringLiteral("--startmenu"), logging("menu")});
    QVERIFY(m_bridge.waitForStarted());
    QTRY_VERIFY((owner.processEvents(), lost));
    owner.release();
    QTRY_VERIFY(send("VELWM_UPDATE_STARTMENU\n"));
    QTRY_VERIFY(QFile::exists(log()));
}

void tst_vel_wmbridge::endsWhenTheChannelIsTaken()
{
    start({});
    WmCommandReceiver other([](const std::string &) {});
    QVERIFY(other.acquire(true));

    QVERIFY(m_bridge.waitForFinished());
    QCOMPARE(m_bridge.exitCode(), 1);
    QCOMPARE(m_bridge.readAllStandardError(),
             QByteArray("vel-wmbridge: another program has taken the channel\n"));
}

void tst_vel_wmbridge::givesTheChannelUpOnTermination()
{
    start({});
    m_bridge.terminate();
    QVERIFY(m_bridge.waitForFinished());
    QCOMPARE(m_bridge.exitStatus(), QProcess::NormalExit);
    QCOMPARE(m_bridge.exitCode(), 0);
    QVERIFY(!send("VELWM_UPDATE_STARTMENU\n"));
}

void tst_vel_wmbridge::endsWithoutADisplay()
{
    QProcessEnvironment environment = QProcessEnvironment::systemEnvironment();
    environment.remove(QStringLiteral("DISPLAY"));
    QProcess bridge;
    bridge.setProcessEnvironment(environment);
    bridge.start(QStringLiteral(VEL_PROGRAM), QStringList());
    QVERIFY(bridge.waitForFinished());
    QCOMPARE(bridge.exitCode(), 1);
    QVERIFY(bridge.readAllStandardError().startsWith("vel-wmbridge: cannot take the channel"));
}

void tst_vel_wmbridge::runsCommandsWithoutItsOwnFiles()
{
    // What a shell has open besides its streams. Some of it may come from whoever runs the tests.
    const QString listing = QStringLiteral("exec > '%1.new'; cd /proc/$$/fd; for file in ?*; do "
                                           "case $file in [012]) ;; *) readlink $file ;; esac; done; "
                                           "mv '%1.new' '%1'");
    const QString usual = path(QStringLiteral("usual"));
    QProcess::execute(QStringLiteral("/bin/sh"), {QStringLiteral("-c"), listing.arg(usual)});

    start({QStringLiteral("--startmenu"), listing.arg(log())});
    QVERIFY(send("VELWM_UPDATE_STARTMENU\n"));
    QTRY_VERIFY(QFile::exists(log()));
    const QByteArrayList known = read(usual).split('\n');
    for (const QByteArray &file : read(log()).split('\n'))
        QVERIFY2(known.contains(file), file.constData());
}

void tst_vel_wmbridge::mergesEqualLinesThatWait()
{
    start({QStringLiteral("--startmenu"), waiting("menu"), QStringLiteral("--toolbar"), logging("bar")});
    const QByteArray begun("menu VELWM_UPDATE_STARTMENU");
    QVERIFY(send("VELWM_UPDATE_STARTMENU\n"));
    QTRY_COMPARE(logged(), QByteArrayList{begun});

    // What changed after the first has begun is not lost on it.
    QVERIFY(send(QByteArray("VELWM_UPDATE_STARTMENU\n").repeated(1000)));
    QVERIFY(send("VELWM_UPDATE_TOOLBAR\n"));
    QTRY_VERIFY(logged().contains("bar VELWM_UPDATE_TOOLBAR"));
    QCOMPARE(logged().count(begun), 1);
    openGate();
    QTRY_COMPARE(logged().count("end VELWM_UPDATE_STARTMENU"), 2);
    QVERIFY(send("VELWM_UPDATE_TOOLBAR\n"));
    QTRY_COMPARE(logged().count("bar VELWM_UPDATE_TOOLBAR"), 2);
    QCOMPARE(logged().count(begun), 2);
}

void tst_vel_wmbridge::runsOtherCommandsBesideOneThatStays()
{
    start({QStringLiteral("--startmenu"), waiting("menu"), QStringLiteral("--toolbar"), logging("bar")});
    for (int i = 1; i <= 3; ++i) {
        QVERIFY(send("VELWM_UPDATE_STARTMENU\nVELWM_UPDATE_TOOLBAR\n"));
        QTRY_COMPARE(logged().count("bar VELWM_UPDATE_TOOLBAR"), i);
    }
    QCOMPARE(logged().size(), 4);
}

void tst_vel_wmbridge::runsFewCommandsAtATime()
{
    start({QStringLiteral("--other"), waiting("begin")});
    QByteArray lines;
    for (int i = 0; i < 20; ++i)
        lines += "VELWM_" + QByteArray::number(i) + '\n';
    QVERIFY(send(lines));
    QTRY_VERIFY(logged().size() >= 4);
    openGate();
    QTRY_COMPARE(logged().size(), 40);
    int running = 0;
    for (const QByteArray &line : logged()) {
        running += line.startsWith("begin") ? 1 : -1;
        QVERIFY(running <= 4);
    }
}

void tst_vel_wmbridge::tellsOnceThatTooManyLinesWait()
{
    start({QStringLiteral("--other"), waiting("begin")});
    QByteArray lines;
    for (int i = 0; i < 100000; ++i)
        lines += "VELWM_\x1b" + QByteArray::number(i) + '\n';
    QVERIFY(send(lines));
    m_bridge.setReadChannel(QProcess::StandardError);
    QTRY_VERIFY(m_bridge.canReadLine());
    const QByteArray told = m_bridge.readLine();
    QVERIFY2(told.startsWith("vel-wmbridge: cannot run the command for VELWM_?2"), told.constData());
    openGate();
    // What ran and what waited; the line that start() sends may have been one of them.
    QTRY_VERIFY_WITH_TIMEOUT(logged().size() >= 2 * 259, 30000);
    QTRY_VERIFY(logged().size() % 2 == 0);
    QVERIFY(logged().size() <= 2 * 260);
    QCOMPARE(m_bridge.readAll(), QByteArray());
}

void tst_vel_wmbridge::leavesItsCommandsRunningWhenItEnds()
{
    start({QStringLiteral("--startmenu"), waiting("menu")});
    QVERIFY(send("VELWM_UPDATE_STARTMENU\n"));
    QTRY_COMPARE(logged().size(), 1);
    m_bridge.terminate();
    QVERIFY(m_bridge.waitForFinished());
    QCOMPARE(m_bridge.exitStatus(), QProcess::NormalExit);
    openGate();
    QTRY_COMPARE(logged().size(), 2);
}

void tst_vel_wmbridge::keepsTheChannelWhenOthersDestroyItsWindow()
{
    start({QStringLiteral("--startmenu"), logging("menu")});
    const DisplayPointer display(XOpenDisplay(nullptr));
    const Window window = owner(display.get());
    XDestroyWindow(display.get(), window);
    QTRY_VERIFY(owner(display.get()) != None && owner(display.get()) != window);
    QVERIFY(send("VELWM_UPDATE_STARTMENU\n"));
    QTRY_COMPARE(logged(), QByteArrayList{"menu VELWM_UPDATE_STARTMENU"});
}

void tst_vel_wmbridge::keepsTheChannelWhenALossIsOnlySent()
{
    start({QStringLiteral("--startmenu"), logging("menu")});
    const DisplayPointer display(XOpenDisplay(nullptr));
    XEvent event = {};
    event.xselectionclear.type = SelectionClear;
    event.xselectionclear.window = owner(display.get());
    event.xselectionclear.selection = XInternAtom(display.get(), "_VELWM_COMMAND_S0", False);
    XSendEvent(display.get(), event.xselectionclear.window, False, NoEventMask, &event);
    XSync(display.get(), False);
    QVERIFY(send("VELWM_UPDATE_STARTMENU\n"));
    QTRY_COMPARE(logged(), QByteArrayList{"menu VELWM_UPDATE_STARTMENU"});
    QCOMPARE(m_bridge.state(), QProcess::Running);
}

void tst_vel_wmbridge::provide(const char *name, const QString &commands)
{
    const QString file =
        write(QStringLiteral("bin/") + QLatin1String(name), "#!/bin/sh\n" + commands.toUtf8() + '\n');
    QVERIFY(QFile::setPermissions(file, QFile::ReadOwner | QFile::ExeOwner));
    auto environment = QProcessEnvironment::systemEnvironment();
    environment.insert(QStringLiteral("PATH"),
                       path(QStringLiteral("bin:")) + environment.value(QStringLiteral("PATH")));
    environment.insert(QStringLiteral("HOME"), folder());
    m_bridge.setProcessEnvironment(environment);
}

void tst_vel_wmbridge::doesWhatAWindowManagerNeeds_data()
{
    QTest::addColumn<QString>("manager");
    QTest::newRow("labwc") << QStringLiteral("labwc");
    QTest::newRow("openbox") << QStringLiteral("openbox");
}

void tst_vel_wmbridge::doesWhatAWindowManagerNeeds()
{
    QFETCH(QString, manager);
    provide(manager.toLatin1(), QStringLiteral("echo \"$@\" >>'%1'").arg(log()));
    start({QStringLiteral("--for"), manager});
    QVERIFY(!QFile::exists(log()));
    QVERIFY(send("VELWM_UPDATE_STARTMENU\n"));
    QTRY_COMPARE_WITH_TIMEOUT(logged(), QByteArrayList{"--reconfigure"}, 20000);
}

void tst_vel_wmbridge::prefersTheCommandThatIsGiven()
{
    provide("openbox", QStringLiteral("echo openbox >>'%1'").arg(log()));
    start(
        {QStringLiteral("--for"), QStringLiteral("openbox"), QStringLiteral("--startmenu"), logging("mine")});
    QVERIFY(send("VELWM_UPDATE_STARTMENU\n"));
    QTRY_COMPARE_WITH_TIMEOUT(logged(), QByteArrayList{"mine VELWM_UPDATE_STARTMENU"}, 20000);
}

void tst_vel_wmbridge::preparesTheMenuOfFluxboxAtTheStart()
{
    provide("vel-menuprint", QStringLiteral("cat '%1'").arg(write(QStringLiteral("menu"), "first")));
    start({QStringLiteral("--for"), QStringLiteral("fluxbox")});
    const QString file = path(QStringLiteral(".fluxbox/vel-menu"));
    QTRY_VERIFY_WITH_TIMEOUT(QFile::exists(file), 20000);
    QCOMPARE(read(file), QByteArray("first"));
    write(QStringLiteral("menu"), "second");
    QVERIFY(send("VELWM_UPDATE_STARTMENU\n"));
    QTRY_COMPARE_WITH_TIMEOUT(read(file), QByteArray("second"), 20000);
}

void tst_vel_wmbridge::refusesUnknownArguments_data()
{
    QTest::addColumn<QString>("argument");
    QTest::addColumn<QByteArray>("message");
    QTest::newRow("word") << QStringLiteral("now") << QByteArray("vel-wmbridge: unexpected argument: now\n");
    QTest::newRow("option") << QStringLiteral("--now") << QByteArray("vel-wmbridge: Unknown option 'now'.\n");
    QTest::newRow("window manager")
        << QStringLiteral("--for=other")
        << QByteArray("vel-wmbridge: unknown window manager: other (known are fluxbox, icewm, jwm, labwc, "
                      "openbox)\n");
    QTest::newRow("no command") << QStringLiteral("--other")
                                << QByteArray("vel-wmbridge: Missing value after '--other'.\n");
}

void tst_vel_wmbridge::refusesUnknownArguments()
{
    QFETCH(QString, argument);
    QFETCH(QByteArray, message);
    m_bridge.start(QStringLiteral(VEL_PROGRAM), {argument});
    QVERIFY(m_bridge.waitForFinished());
    QCOMPARE(m_bridge.exitCode(), 2);
    QCOMPARE(m_bridge.readAllStandardError(), message);
}

VEL_TEST_GUILESS_MAIN(tst_vel_wmbridge)

#include "tst_vel_wmbridge.moc"
