// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <velintegration/wmcommand.h>
#include <velintegration/wmcommandreceiver.h>

#include <QFile>
#include <QProcess>

#include <X11/Xlib.h>

#include <signal.h>

namespace {

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
    void refusesUnknownArguments_data();
    void refusesUnknownArguments();

private:
    void start(const QStringList &arguments);
    QString log() const { return path(QStringLiteral("log")); }
    QString logging(const char *word) const
    {
        return QStringLiteral("echo %1 \"$VEL_COMMAND\" >> '%2'").arg(QLatin1String(word), log());
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

void tst_vel_wmbridge::refusesUnknownArguments_data()
{
    QTest::addColumn<QString>("argument");
    QTest::addColumn<QByteArray>("message");
    QTest::newRow("word") << QStringLiteral("now") << QByteArray("vel-wmbridge: unexpected argument: now\n");
    QTest::newRow("option") << QStringLiteral("--now") << QByteArray("vel-wmbridge: Unknown option 'now'.\n");
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
