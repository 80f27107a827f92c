// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <velintegration/wmcommandreceiver.h>

#include <QDBusConnection>
#include <QDBusContext>
#include <QDBusMessage>
#include <QDir>
#include <QElapsedTimer>
#include <QProcess>
#include <QTimer>

#include <memory>

#include <fcntl.h>
#include <sys/types.h>
#include <unistd.h>

/// An application on the session bus.
class BusApplication : public QObject, protected QDBusContext
{
    Q_OBJECT
    Q_CLASSINFO("D-Bus Interface", "org.freedesktop.Application")

public:
    enum Manner { Answers, Refuses, Hesitates, Leaves };
    explicit BusApplication(Manner manner)
        : m_manner(manner)
    {
    }
    int activations() const { return m_activations; }
    QVariantMap platformData() const { return m_platformData; }

public Q_SLOTS:
    void Activate(const QVariantMap &platformData)
    {
        ++m_activations;
        m_platformData = platformData;
        if (m_manner == Refuses)
            sendErrorReply(QStringLiteral("org.example.Error"), QStringLiteral("no"));
        else if (m_manner != Answers)
            setDelayedReply(true);
        if (m_manner == Leaves)
            QTimer::singleShot(0, this, &BusApplication::left);
    }

Q_SIGNALS:
    void left();

private:
    Manner m_manner;
    int m_activations = 0;
    QVariantMap m_platformData;
};

class VelOpenTest : public TestCase
{
    Q_OBJECT

private:
    static QString program()
    {
        return QCoreApplication::applicationDirPath() + QStringLiteral("/../bin/vel-open");
    }
    QByteArray bytes(const QString &text) const { return QFile::encodeName(text); }
    QString script(const QString &name, const QByteArray &commands);
    QString probe(const QByteArray &name, const QByteArray &what);
    QString entry(const QByteArray &keys, const QString &name = QStringLiteral("x.desktop"));
    QString application(const QByteArray &keys) { return entry("Type=Application\nName=x\n" + keys); }
    int open(const QString &path);
    QByteArray told(const char *name = "told") const;
    QString startBus();
    void activate(BusApplication::Manner manner, int activations, bool execRuns,
                  const QByteArray &beforeAll = QByteArray());

    QByteArray m_path;
    QByteArray m_error;
    qint64 m_time = 0;
    std::unique_ptr<QProcess> m_bus;

private Q_SLOTS:
    void init();
    void cleanup();

    void failsWithoutAPath();
    void tellsHowItIsUsed();
    void failsWithOneLineForAMissingFile();
    void failsForAnEntryThatCannotRun_data();
    void failsForAnEntryThatCannotRun();
    void runsTheCommandWithItsArguments();
    void tellsTheProgramItsNameInTheUsersLanguage();
    void findsAPathThatIsRelative();
    void startsInTheFolderOfTheEntry();
    void givesTheProgramASessionOfItsOwn_data();
    void givesTheProgramASessionOfItsOwn();
    void keepsTheProgramOffTheFilesOfTheCaller();
    void programOutlivesIt();
    void runsTerminalEntriesInATerminal_data();
    void runsTerminalEntriesInATerminal();
    void failsWithoutATerminal();
    void failsForATerminalEntryWithoutItsProgram();
    void opensLinksFoldersAndFiles_data();
    void opensLinksFoldersAndFiles();
    void failsWhenNothingOpensTheFile();
    void doesNotWaitForABrowser();
    void sendsWindowManagerCommands();
    void failsWithoutAWindowManager();
    void activatesOverTheBusFirst_data();
    void activatesOverTheBusFirst();
    void runsTheCommandWhenTheBusRefuses();
    void runsTheCommandWhenTheApplicationGoesAway();
    void handsTheStartupIdOn();
    void runsTheCommandWhenNobodyIsOnTheBus();
    void runsTheCommandWithoutABus();
    void leavesAnApplicationThatTakesItsTimeAlone();
    void asksNoBusForOtherEntries();
};

void VelOpenTest::init()
{
    TestCase::init();
    m_path = qgetenv("PATH");
    qputenv("PATH", bytes(path(QStringLiteral("bin"))) + ':' + m_path);
}

void VelOpenTest::cleanup()
{
    QDBusConnection::disconnectFromBus(QStringLiteral("test"));
    if (m_bus) {
        m_bus->terminate();
        m_bus->waitForFinished();
        m_bus.reset();
    }
    qputenv("PATH", m_path);
    qunsetenv("TERMINAL");
    qunsetenv("DBUS_SESSION_BUS_ADDRESS");
    TestCase::cleanup();
}

QString VelOpenTest::script(const QString &name, const QByteArray &commands)
{
    const QString file = write(QStringLiteral("bin/") + name, "#!/bin/sh\n" + commands);
    QFile::setPermissions(file, QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner);
    return file;
}

// A program that tells something: the file appears when all of it is written.
QString VelOpenTest::probe(const QByteArray &name, const QByteArray &what)
{
    const QByteArray told = "'" + bytes(folder());
    return script(QFile::decodeName(name),
                  "text=$(" + what + "\necho .)\nprintf %s \"${text%.}\" >" + told + "/new'\n/bin/mv " + told
                      + "/new' " + told + "/told'\n");
}

QString VelOpenTest::entry(const QByteArray &keys, const QString &name)
{
    return write(name, "[Desktop Entry]\n" + keys);
}

int VelOpenTest::open(const QString &path)
{
    QProcess process;
    QElapsedTimer timer;
    timer.start();
    process.setWorkingDirectory(folder());
    process.start(program(), {QStringLiteral("--exec"), path});
    // Events go on meanwhile: the applications on the bus live in this process.
    if (!QTest::qWaitFor([&process] { return process.state() == QProcess::NotRunning; }, 20000))
        return -2;
    m_time = timer.elapsed();
    m_error = process.readAllStandardError();
    return process.exitStatus() == QProcess::NormalExit ? process.exitCode() : -1;
}

QByteArray VelOpenTest::told(const char *name) const
{
    QFile file(path(QString::fromLatin1(name)));
    return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
}

void VelOpenTest::failsWithoutAPath()
{
    for (const char *arguments : {"", "--exec", "--exec|", "x|y", "--exec|a|b"}) {
        QProcess process;
        process.start(program(), QString::fromLatin1(arguments).split(QLatin1Char('|')));
        QVERIFY(process.waitForFinished());
        QCOMPARE(process.exitCode(), 2);
        QCOMPARE(process.readAllStandardError().count('\n'), 1);
    }
}

void VelOpenTest::tellsHowItIsUsed()
{
    QProcess process;
    process.start(program(), {QStringLiteral("--help")});
    QVERIFY(process.waitForFinished());
    QCOMPARE(process.exitCode(), 0);
    QVERIFY(process.readAllStandardOutput().startsWith("usage: vel-open --exec PATH"));
    process.start(program(), {QStringLiteral("--version")});
    QVERIFY(process.waitForFinished());
    QCOMPARE(process.readAllStandardOutput(), QByteArray("vel-open " VEL_VERSION "\n"));
}

void VelOpenTest::failsWithOneLineForAMissingFile()
{
    QCOMPARE(open(path(QStringLiteral("a\nb.desktop"))), 1);
    QCOMPARE(m_error.count('\n'), 1);
    QVERIFY2(m_error.startsWith("vel-open: "), m_error.constData());
    QVERIFY2(m_error.contains("a?b.desktop: "), m_error.constData());
}

void VelOpenTest::failsForAnEntryThatCannotRun_data()
{
    QTest::addColumn<QByteArray>("contents");
    const QByteArray start = "[Desktop Entry]\nType=Application\nName=x\n";
    QTest::newRow("no entry") << QByteArray("garbage\0\xff");
    QTest::newRow("empty") << QByteArray();
    QTest::newRow("no command") << start;
    QTest::newRow("blank command") << start + "Exec=\\s\n";
    QTest::newRow("open quote") << start + "Exec=true \"x\n";
    QTest::newRow("unknown field code") << start + "Exec=true %x\n";
    QTest::newRow("no such program") << start + "Exec=no-such-program-here\n";
    QTest::newRow("no such file") << start + "Exec=/no/such/program\n";
    QTest::newRow("not executable") << start + "Exec=/etc/passwd\n";
    QTest::newRow("a folder") << start + "Exec=/etc\n";
    QTest::newRow("cannot be executed") << start + "Exec=broken-interpreter\n";
    QTest::newRow("no such folder") << start + "Exec=true\nPath=/no/such/folder\n";
    QTest::newRow("no type") << QByteArray("[Desktop Entry]\nName=x\nExec=true\n");
    QTest::newRow("unknown type") << QByteArray("[Desktop Entry]\nType=Other\nName=x\nExec=true\n");
    QTest::newRow("link without URL") << QByteArray("[Desktop Entry]\nType=Link\nName=x\n");
}

void VelOpenTest::failsForAnEntryThatCannotRun()
{
    QFETCH(QByteArray, contents);
    const QString broken = write(QStringLiteral("bin/broken-interpreter"), "#!/no/such/interpreter\n");
    QVERIFY(QFile::setPermissions(broken, QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner));
    QCOMPARE(open(write(QStringLiteral("x.desktop"), contents)), 1);
    QCOMPARE(m_error.count('\n'), 1);
    QVERIFY2(m_error.startsWith("vel-open: " + bytes(path(QStringLiteral("x.desktop"))) + ": "),
             m_error.constData());
}

void VelOpenTest::runsTheCommandWithItsArguments()
{
    probe("my probe", "printf '%s|' \"$@\"");
    const QString path =
        entry("Type=Application\nName=It's\nIcon=my icon\n"
              "Exec=\"my probe\" \"a  b\" \"\\\\$\\\\\"\\\\\\\\\" c %% %i %c %k %f %F %u %U %d end\n",
              QStringLiteral("odd 'name.desktop"));
    QCOMPARE(open(path), 0);
    QCOMPARE(m_error, QByteArray());
    QTRY_COMPARE(told(), "a  b|$\"\\|c|%|--icon|my icon|It's|" + bytes(path) + "|end|");
}

void VelOpenTest::tellsTheProgramItsNameInTheUsersLanguage()
{
    probe("probe", "printf '%s|' \"$@\"");
    const QByteArray before = qgetenv("LC_ALL");
    qputenv("LC_ALL", "de_DE.UTF-8");
    QCOMPARE(open(application("Name[de]=Ding\nExec=probe %c\n")), 0);
    qputenv("LC_ALL", before);
    QTRY_COMPARE(told(), QByteArray("Ding|"));
}

void VelOpenTest::findsAPathThatIsRelative()
{
    probe("probe", "printf %s \"$1\"");
    const QString path = application("Exec=probe %k\n");
    QCOMPARE(open(QStringLiteral("x.desktop")), 0);
    QTRY_COMPARE(told(), bytes(path));
}

void VelOpenTest::startsInTheFolderOfTheEntry()
{
    probe("probe", "/bin/pwd");
    QDir().mkpath(path(QStringLiteral("some where")));
    QCOMPARE(open(application("Exec=probe\nPath=" + bytes(path(QStringLiteral("some where"))) + '\n')), 0);
    QTRY_COMPARE(told(), bytes(path(QStringLiteral("some where"))) + '\n');
    // A program that is named from there is looked for there.
    script(QStringLiteral("../some where/local"), "echo >'" + bytes(path(QStringLiteral("local"))) + "'\n");
    QCOMPARE(open(application("Exec=./local\nPath=" + bytes(path(QStringLiteral("some where"))) + '\n')), 0);
    QTRY_COMPARE(told("local"), QByteArray("\n"));
}

void VelOpenTest::givesTheProgramASessionOfItsOwn_data()
{
    QTest::addColumn<QByteArray>("program");
    QTest::addColumn<QByteArray>("keys");
    QTest::newRow("application") << QByteArray("probe") << QByteArray("Type=Application\nExec=probe\n");
    QTest::newRow("link") << QByteArray("xdg-open") << QByteArray("Type=Link\nURL=https://localhost/\n");
}

void VelOpenTest::givesTheProgramASessionOfItsOwn()
{
    QFETCH(QByteArray, program);
    QFETCH(QByteArray, keys);
    probe(program, "/bin/ps -o sid= -p $$");
    QCOMPARE(open(entry(keys)), 0);
    QTRY_VERIFY(!told().isEmpty());
    const int session = told().trimmed().toInt();
    QVERIFY(session > 0);
    QVERIFY(session != getsid(0));
}

void VelOpenTest::keepsTheProgramOffTheFilesOfTheCaller()
{
    int ends[2];
    QCOMPARE(pipe(ends), 0); // inherited by all that is started here
    // A command substitution would give the script a pipe of its own.
    script(QStringLiteral("probe"),
           "for n in /proc/$$/fd/*; do /bin/readlink $n; done >'" + bytes(path(QStringLiteral("new")))
               + "'\n/bin/mv '" + bytes(path(QStringLiteral("new"))) + "' '"
               + bytes(path(QStringLiteral("told"))) + "'\n");
    QCOMPARE(open(application("Exec=probe\n")), 0);
    close(ends[0]);
    close(ends[1]);
    QTRY_VERIFY(!told().isEmpty());
    QVERIFY2(told().count("/dev/null\n") >= 3, told().constData());
    QVERIFY2(!told().contains("pipe:"), told().constData());
    QVERIFY2(!told().contains("socket:"), told().constData());
}

void VelOpenTest::programOutlivesIt()
{
    probe("probe",
          "while ! [ -e '" + bytes(path(QStringLiteral("go"))) + "' ]; do /bin/sleep 0.02; done; echo alive");
    QCOMPARE(open(application("Exec=probe\n")), 0);
    QVERIFY2(m_time < 2000, qPrintable(QString::number(m_time)));
    QCOMPARE(told(), QByteArray());
    write(QStringLiteral("go"), "");
    QTRY_COMPARE(told(), QByteArray("alive\n"));
}

void VelOpenTest::runsTerminalEntriesInATerminal_data()
{
    QTest::addColumn<QByteArray>("variable");
    QTest::addColumn<QByteArray>("installed");
    QTest::addColumn<QByteArray>("expected");
    QTest::newRow("the preferred one")
        << QByteArray("my-term") << QByteArray("my-term x-terminal-emulator xterm")
        << QByteArray("my-term|-e|");
    QTest::newRow("with arguments") << QByteArray("my-term --title 'a b'") << QByteArray("my-term xterm")
                                    << QByteArray("my-term|--title|a b|-e|");
    QTest::newRow("none preferred") << QByteArray() << QByteArray("x-terminal-emulator xterm")
                                    << QByteArray("x-terminal-emulator|-e|");
    QTest::newRow("the preferred one is not installed")
        << QByteArray("my-term") << QByteArray("x-terminal-emulator xterm")
        << QByteArray("x-terminal-emulator|-e|");
    QTest::newRow("only xterm") << QByteArray() << QByteArray("xterm") << QByteArray("xterm|-e|");
}

void VelOpenTest::runsTerminalEntriesInATerminal()
{
    QFETCH(QByteArray, variable);
    QFETCH(QByteArray, installed);
    QFETCH(QByteArray, expected);
    for (const QByteArray &terminal : installed.split(' '))
        probe(terminal, "printf '%s|' " + terminal + " \"$@\"");
    script(QStringLiteral("program"), "");
    if (!variable.isEmpty())
        qputenv("TERMINAL", variable);
    qputenv("PATH", bytes(path(QStringLiteral("bin"))));
    QCOMPARE(open(application("Exec=program \"a b\"\nTerminal=true\n")), 0);
    QTRY_COMPARE(told(), expected + "program|a b|");
}

void VelOpenTest::failsWithoutATerminal()
{
    script(QStringLiteral("program"), "");
    qputenv("PATH", bytes(path(QStringLiteral("bin"))));
    QCOMPARE(open(application("Exec=program\nTerminal=true\n")), 1);
    QCOMPARE(m_error.count('\n'), 1);
}

void VelOpenTest::failsForATerminalEntryWithoutItsProgram()
{
    probe("xterm", "echo started");
    qputenv("PATH", bytes(path(QStringLiteral("bin"))));
    QCOMPARE(open(application("Exec=no-such-program\nTerminal=true\n")), 1);
    QCOMPARE(told(), QByteArray());
}

void VelOpenTest::opensLinksFoldersAndFiles_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<QByteArray>("contents");
    QTest::addColumn<QString>("opened"); // "~" for the test's folder
    QTest::newRow("link") << "x.desktop"
                          << QByteArray("[Desktop Entry]\nType=Link\nURL=https://localhost/a b?c=%20\n")
                          << "https://localhost/a b?c=%20";
    QTest::newRow("folder") << "sub/" << QByteArray() << "~/sub/";
    QTest::newRow("folder named like an entry") << "sub.desktop/" << QByteArray() << "~/sub.desktop/";
    QTest::newRow("text") << "notes.txt" << QByteArray("text") << "~/notes.txt";
    QTest::newRow("entry of a folder")
        << "sub/a.desktop" << QByteArray("[Desktop Entry]\nType=Directory\n") << "~/sub";
}

void VelOpenTest::opensLinksFoldersAndFiles()
{
    QFETCH(QString, name);
    QFETCH(QByteArray, contents);
    QFETCH(QString, opened);
    probe("xdg-open", "printf '%s|' \"$@\"");
    if (name.endsWith(QLatin1Char('/')))
        QVERIFY(QDir().mkpath(path(name)));
    else
        write(name, contents);
    QCOMPARE(open(path(name)), 0);
    QTRY_COMPARE(told(), bytes(opened.replace(QLatin1Char('~'), folder())) + '|');
}

void VelOpenTest::failsWhenNothingOpensTheFile()
{
    const QString file = write(QStringLiteral("notes.txt"), "text");
    script(QStringLiteral("xdg-open"), "exit 3\n");
    QCOMPARE(open(file), 1);
    QCOMPARE(m_error.count('\n'), 1);
    QVERIFY(QFile::remove(path(QStringLiteral("bin/xdg-open"))));
    qputenv("PATH", bytes(path(QStringLiteral("bin"))));
    QCOMPARE(open(file), 1);
    QCOMPARE(m_error.count('\n'), 1);
}

void VelOpenTest::doesNotWaitForABrowser()
{
    probe("xdg-open",
          "while ! [ -e '" + bytes(path(QStringLiteral("go"))) + "' ]; do /bin/sleep 0.02; done; echo alive");
    QCOMPARE(open(write(QStringLiteral("page.html"), "<p>")), 0);
    QVERIFY2(m_time < 2000, qPrintable(QString::number(m_time)));
    write(QStringLiteral("go"), "");
    QTRY_COMPARE(told(), QByteArray("alive\n"));
}

void VelOpenTest::sendsWindowManagerCommands()
{
    QList<QByteArray> lines;
    WmCommandReceiver receiver([&lines](const std::string &line) { lines.append(line.c_str()); });
    QVERIFY(receiver.acquire());
    QCOMPARE(open(application("Exec=VELWM_MOVE  1 \"2\" %f\n")), 0);
    receiver.processEvents();
    QCOMPARE(lines, QList<QByteArray>({"VELWM_MOVE  1 \"2\" %f"}));
}

void VelOpenTest::failsWithoutAWindowManager()
{
    QCOMPARE(open(application("Exec=VELWM_QUIT\n")), 1);
    QCOMPARE(m_error.count('\n'), 1);
}

QString VelOpenTest::startBus()
{
    m_bus.reset(new QProcess);
    m_bus->start(QStringLiteral("dbus-daemon"),
                 {QStringLiteral("--session"), QStringLiteral("--nofork"), QStringLiteral("--nopidfile"),
                  QStringLiteral("--print-address=1")});
    QByteArray address;
    while (!address.endsWith('\n') && m_bus->waitForReadyRead(10000))
        address += m_bus->readAllStandardOutput();
    qputenv("DBUS_SESSION_BUS_ADDRESS", address.trimmed());
    return QString::fromLatin1(address.trimmed());
}

void VelOpenTest::activate(BusApplication::Manner manner, int activations, bool execRuns,
                           const QByteArray &beforeAll)
{
    const QString address = startBus();
    QVERIFY(!address.isEmpty());
    {
        QDBusConnection bus = QDBusConnection::connectToBus(address, QStringLiteral("test"));
        QVERIFY(bus.isConnected());
        BusApplication application(manner);
        QVERIFY(bus.registerService(QStringLiteral("org.example.My-App")));
        QVERIFY(bus.registerObject(QStringLiteral("/org/example/My_App"), &application,
                                   QDBusConnection::ExportAllSlots));
        connect(&application, &BusApplication::left, this, [&bus] {
            QDBusConnection::disconnectFromBus(QStringLiteral("test"));
            bus = QDBusConnection(QString()); // the last one that held it
        });
        probe("probe", "echo ran");
        // Where the command must not run, to try it would be an error.
        const QByteArray program = execRuns ? "probe" : "no-such-program-here";
        const QString path = write(QStringLiteral("org.example.My-App.desktop"),
                                   beforeAll + "[Desktop Entry]\nType=Application\nName=x\nExec=" + program
                                       + "\nDBusActivatable=true\n");
        QCOMPARE(open(path), 0);
        QVERIFY2(m_time < 2000, qPrintable(QString::number(m_time)));
        QCOMPARE(application.activations(), activations);
        QCOMPARE(application.platformData().value(QStringLiteral("desktop-startup-id")).toByteArray(),
                 qgetenv("DESKTOP_STARTUP_ID"));
    }
    if (execRuns)
        QTRY_COMPARE(told(), QByteArray("ran\n"));
}

void VelOpenTest::activatesOverTheBusFirst_data()
{
    QTest::addColumn<QByteArray>("beforeAll");
    QTest::newRow("plain") << QByteArray();
    QTest::newRow("byte order mark") << QByteArray("\xEF\xBB\xBF");
}

void VelOpenTest::activatesOverTheBusFirst()
{
    QFETCH(QByteArray, beforeAll);
    activate(BusApplication::Answers, 1, false, beforeAll);
}

void VelOpenTest::runsTheCommandWhenTheBusRefuses()
{
    activate(BusApplication::Refuses, 1, true);
}

void VelOpenTest::runsTheCommandWhenTheApplicationGoesAway()
{
    activate(BusApplication::Leaves, 1, true);
}

void VelOpenTest::handsTheStartupIdOn()
{
    qputenv("DESKTOP_STARTUP_ID", "menu_TIME1234");
    activate(BusApplication::Answers, 1, false);
    qunsetenv("DESKTOP_STARTUP_ID");
}

void VelOpenTest::runsTheCommandWhenNobodyIsOnTheBus()
{
    QVERIFY(!startBus().isEmpty());
    probe("probe", "echo ran");
    const QByteArray keys = "Type=Application\nName=x\nExec=probe\nDBusActivatable=true\n";
    QCOMPARE(open(entry(keys, QStringLiteral("org.example.Nobody.desktop"))), 0);
    QTRY_COMPARE(told(), QByteArray("ran\n"));
    QVERIFY(QFile::remove(path(QStringLiteral("told"))));
    QCOMPARE(open(entry(keys, QStringLiteral("no bus name.desktop"))), 0);
    QTRY_COMPARE(told(), QByteArray("ran\n"));
    // Without a command there is nothing to fall back on.
    QCOMPARE(open(entry("Type=Application\nName=x\nDBusActivatable=true\n",
                        QStringLiteral("org.example.Nobody.desktop"))),
             1);
}

void VelOpenTest::runsTheCommandWithoutABus()
{
    probe("probe", "echo ran");
    const QByteArray keys = "Type=Application\nName=x\nExec=probe\nDBusActivatable=true\n";
    QCOMPARE(open(entry(keys, QStringLiteral("org.example.App.desktop"))), 0);
    QTRY_COMPARE(told(), QByteArray("ran\n"));
}

void VelOpenTest::leavesAnApplicationThatTakesItsTimeAlone()
{
    activate(BusApplication::Hesitates, 1, false);
}

void VelOpenTest::asksNoBusForOtherEntries()
{
    const QString address = startBus();
    {
        QDBusConnection bus = QDBusConnection::connectToBus(address, QStringLiteral("test"));
        BusApplication application(BusApplication::Answers);
        QVERIFY(bus.registerService(QStringLiteral("org.example.App")));
        QVERIFY(bus.registerObject(QStringLiteral("/org/example/App"), &application,
                                   QDBusConnection::ExportAllSlots));
        probe("probe", "echo ran");
        QCOMPARE(open(entry("Type=Application\nName=x\nExec=probe\nDBusActivatable=false\n"
                            "[Desktop Action a]\nDBusActivatable=true\n",
                            QStringLiteral("org.example.App.desktop"))),
                 0);
        QCOMPARE(application.activations(), 0);
    }
    QTRY_COMPARE(told(), QByteArray("ran\n"));
}

VEL_TEST_GUILESS_MAIN(VelOpenTest)
#include "tst_vel_open.moc"
