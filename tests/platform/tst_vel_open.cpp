// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "VelOpenTestCase.h"

#include <velintegration/wmcommandreceiver.h>

#include <QDir>
#include <QProcess>

#include <fcntl.h>
#include <pwd.h>
#include <unistd.h>

/// The program that opens an entry, a link, a folder or a file.
class tst_vel_open : public VelOpenTestCase
{
    Q_OBJECT

private Q_SLOTS:
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
    void startsTheProgramWithoutStreamsOfItsOwn_data();
    void startsTheProgramWithoutStreamsOfItsOwn();
    void tellsWhyWithoutInputAndOutput();
    void givesTheProgramAHome();
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
};

void tst_vel_open::failsWithoutAPath()
{
    for (const char *arguments : {"", "--exec", "--exec|", "x|y", "--exec|a|b", "--trust", "--trust|--exec",
                                  "--trust|x", "--exec|a|--trust"}) {
        QProcess process;
        process.start(program(), QString::fromLatin1(arguments).split(QLatin1Char('|')));
        QVERIFY(process.waitForFinished());
        QCOMPARE(process.exitCode(), 2);
        QCOMPARE(process.readAllStandardError().count('\n'), 1);
    }
}

void tst_vel_open::tellsHowItIsUsed()
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

void tst_vel_open::failsWithOneLineForAMissingFile()
{
    QCOMPARE(open(path(QStringLiteral("a\nb.desktop"))), 1);
    QCOMPARE(m_error.count('\n'), 1);
    QVERIFY2(m_error.startsWith("vel-open: "), m_error.constData());
    QVERIFY2(m_error.contains("a?b.desktop: "), m_error.constData());
}

void tst_vel_open::failsForAnEntryThatCannotRun_data()
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

void tst_vel_open::failsForAnEntryThatCannotRun()
{
    QFETCH(QByteArray, contents);
    const QString broken = write(QStringLiteral("bin/broken-interpreter"), "#!/no/such/interpreter\n");
    QVERIFY(QFile::setPermissions(broken, QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner));
    QCOMPARE(open(write(QStringLiteral("x.desktop"), contents)), 1);
    QCOMPARE(m_error.count('\n'), 1);
    QVERIFY2(m_error.startsWith("vel-open: " + bytes(path(QStringLiteral("x.desktop"))) + ": "),
             m_error.constData());
}

void tst_vel_open::runsTheCommandWithItsArguments()
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

void tst_vel_open::tellsTheProgramItsNameInTheUsersLanguage()
{
    probe("probe", "printf '%s|' \"$@\"");
    const QByteArray before = qgetenv("LC_ALL");
    qputenv("LC_ALL", "de_DE.UTF-8");
    QCOMPARE(open(application("Name[de]=Ding\nExec=probe %c\n")), 0);
    qputenv("LC_ALL", before);
    QTRY_COMPARE(told(), QByteArray("Ding|"));
}

void tst_vel_open::findsAPathThatIsRelative()
{
    probe("probe", "printf %s \"$1\"");
    const QString path = application("Exec=probe %k\n");
    QCOMPARE(open(QStringLiteral("x.desktop")), 0);
    QTRY_COMPARE(told(), bytes(path));
}

void tst_vel_open::startsInTheFolderOfTheEntry()
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

void tst_vel_open::givesTheProgramASessionOfItsOwn_data()
{
    QTest::addColumn<QByteArray>("program");
    QTest::addColumn<QByteArray>("keys");
    QTest::newRow("application") << QByteArray("probe") << QByteArray("Type=Application\nExec=probe\n");
    QTest::newRow("link") << QByteArray("xdg-open") << QByteArray("Type=Link\nURL=https://localhost/\n");
}

void tst_vel_open::givesTheProgramASessionOfItsOwn()
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

void tst_vel_open::keepsTheProgramOffTheFilesOfTheCaller()
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

void tst_vel_open::startsTheProgramWithoutStreamsOfItsOwn_data()
{
    QTest::addColumn<QString>("streams");
    for (const char *streams : {"<&- >&-", "<&- >&- 2>&-", "<&-", ">&-", "2>&-"})
        QTest::newRow(streams) << QString::fromLatin1(streams);
}

void tst_vel_open::startsTheProgramWithoutStreamsOfItsOwn()
{
    QFETCH(QString, streams);
    probe("probe", "/bin/readlink /proc/$$/fd/0");
    const QString file = application("Exec=probe\n");
    QProcess shell;
    shell.start(
        QStringLiteral("/bin/sh"),
        {QStringLiteral("-c"), QStringLiteral("exec \"$0\" --exec \"$1\" ") + streams, program(), file});
    QVERIFY(shell.waitForFinished());
    QCOMPARE(shell.readAllStandardError(), QByteArray());
    QCOMPARE(shell.exitCode(), 0);
    QTRY_COMPARE(told(), QByteArray("/dev/null\n"));
}

void tst_vel_open::tellsWhyWithoutInputAndOutput()
{
    QProcess shell;
    shell.start(QStringLiteral("/bin/sh"),
                {QStringLiteral("-c"), QStringLiteral("exec \"$0\" --exec \"$1\" <&- >&-"), program(),
                 application("Exec=there-is-none\n")});
    QVERIFY(shell.waitForFinished());
    QVERIFY(shell.readAllStandardError().contains("there is no program there-is-none"));
    QCOMPARE(shell.exitCode(), 1);
}

void tst_vel_open::givesTheProgramAHome()
{
    const QByteArray home = qgetenv("HOME");
    const passwd *const user = getpwuid(getuid());
    QVERIFY(user);
    probe("probe", "echo $HOME");
    qunsetenv("HOME");
    const int status = open(application("Exec=probe\n"));
    qputenv("HOME", home);
    QCOMPARE(status, 0);
    QTRY_COMPARE(told(), QByteArray(user->pw_dir) + '\n');
}

void tst_vel_open::programOutlivesIt()
{
    probe("probe",
          "while ! [ -e '" + bytes(path(QStringLiteral("go"))) + "' ]; do /bin/sleep 0.02; done; echo alive");
    QCOMPARE(open(application("Exec=probe\n")), 0);
    QVERIFY2(m_time < 2000, qPrintable(QString::number(m_time)));
    QCOMPARE(told(), QByteArray());
    write(QStringLiteral("go"), "");
    QTRY_COMPARE(told(), QByteArray("alive\n"));
}

void tst_vel_open::runsTerminalEntriesInATerminal_data()
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

void tst_vel_open::runsTerminalEntriesInATerminal()
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

void tst_vel_open::failsWithoutATerminal()
{
    script(QStringLiteral("program"), "");
    qputenv("PATH", bytes(path(QStringLiteral("bin"))));
    QCOMPARE(open(application("Exec=program\nTerminal=true\n")), 1);
    QCOMPARE(m_error.count('\n'), 1);
}

void tst_vel_open::failsForATerminalEntryWithoutItsProgram()
{
    probe("xterm", "echo started");
    qputenv("PATH", bytes(path(QStringLiteral("bin"))));
    QCOMPARE(open(application("Exec=no-such-program\nTerminal=true\n")), 1);
    QCOMPARE(told(), QByteArray());
}

void tst_vel_open::opensLinksFoldersAndFiles_data()
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

void tst_vel_open::opensLinksFoldersAndFiles()
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

void tst_vel_open::failsWhenNothingOpensTheFile()
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

void tst_vel_open::doesNotWaitForABrowser()
{
    probe("xdg-open",
          "while ! [ -e '" + bytes(path(QStringLiteral("go"))) + "' ]; do /bin/sleep 0.02; done; echo alive");
    QCOMPARE(open(write(QStringLiteral("page.html"), "<p>")), 0);
    QVERIFY2(m_time < 2000, qPrintable(QString::number(m_time)));
    write(QStringLiteral("go"), "");
    QTRY_COMPARE(told(), QByteArray("alive\n"));
}

void tst_vel_open::sendsWindowManagerCommands()
{
    QList<QByteArray> lines;
    WmCommandReceiver receiver([&lines](const std::string &line) { lines.append(line.c_str()); });
    QVERIFY(receiver.acquire());
    QCOMPARE(open(application("Exec=VELWM_MOVE  1 \"2\" %f\n")), 0);
    receiver.processEvents();
    QCOMPARE(lines, QList<QByteArray>({"VELWM_MOVE  1 \"2\" %f"}));
}

void tst_vel_open::failsWithoutAWindowManager()
{
    QCOMPARE(open(application("Exec=VELWM_QUIT\n")), 1);
    QCOMPARE(m_error.count('\n'), 1);
}

VEL_TEST_GUILESS_MAIN(tst_vel_open)
#include "tst_vel_open.moc"
