// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "OrdinaryUser.h"
#include "StartMenuUpdateTestCase.h"

#include <QProcess>

#include <csignal>

#include "CommandChannel.h"

class tst_vel_menusync : public StartMenuUpdateTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();
    void explainsItself();
    void refusesWhatItDoesNotKnow();
    void tellsThatNoApplicationIsInstalled();
    void tellsWhyTheMenuCannotBeUpdated_data();
    void tellsWhyTheMenuCannotBeUpdated();
    void tellsOnceInAWatchWhatIsWrong();
    void updatesTheMenuOnce();
    void updatesAnotherMenu();
    void tellsTheWindowManagerOfAChange();
    void updatesTheMenuAtTheBeginningOfAWatch();
    void showsWhatIsInstalledMeanwhile();
    void showsWhatIsWrittenInPlace();
    void removesWhatIsRemovedMeanwhile();
    void followsFoldersThatComeLater();
    void endsWhenItIsTold_data();
    void endsWhenItIsTold();
    void theFilesOfTheSessionStartAWatch_data();
    void theFilesOfTheSessionStartAWatch();

private:
    struct Outcome
    {
        int status = -1;
        QByteArray out;
        QByteArray errors;
    };
    Outcome run(const QStringList &arguments) const;
    static void watch(QProcess &program);
    bool shows(const char *name) const { return QFile::exists(inMenu(QString::fromLatin1(name))); }
};

// Longer than any machine takes; that it takes two seconds at most is seen by hand.
#define TRY_VERIFY(condition) QTRY_VERIFY_WITH_TIMEOUT(condition, 20000)

void tst_vel_menusync::init()
{
    StartMenuUpdateTestCase::init();
    qputenv("VEL_CONFIG_HOME", QFile::encodeName(path(QStringLiteral("config/vel"))));
}

void tst_vel_menusync::cleanup()
{
    qunsetenv("VEL_CONFIG_HOME");
    StartMenuUpdateTestCase::cleanup();
}

tst_vel_menusync::Outcome tst_vel_menusync::run(const QStringList &arguments) const
{
    QProcess program;
    program.start(QStringLiteral(VEL_PROGRAM), arguments);
    if (!program.waitForFinished())
        QTest::qFail("the program hangs", __FILE__, __LINE__);
    return {program.exitCode(), program.readAllStandardOutput(), program.readAllStandardError()};
}

void tst_vel_menusync::watch(QProcess &program)
{
    program.start(QStringLiteral(VEL_PROGRAM), {QStringLiteral("--watch")});
    QVERIFY(program.waitForStarted());
}

void tst_vel_menusync::explainsItself()
{
    QVERIFY(run({QStringLiteral("--help")}).out.startsWith("usage: vel-menusync"));
    QCOMPARE(run({QStringLiteral("--version")}).out, QByteArray("vel-menusync " VEL_VERSION "\n"));
}

void tst_vel_menusync::refusesWhatItDoesNotKnow()
{
    for (const QStringList &arguments :
         {QStringList{QStringLiteral("--nonsense")}, QStringList{QStringLiteral("a"), QStringLiteral("b")}}) {
        const Outcome outcome = run(arguments);
        QCOMPARE(outcome.status, 2);
        QCOMPARE(outcome.errors,
                 "vel-menusync: unexpected argument: " + arguments.last().toUtf8()
                     + "; usage: vel-menusync [--watch] [MENU]\n");
    }
    QVERIFY(!QFile::exists(path(QStringLiteral("config"))));
}

void tst_vel_menusync::tellsThatNoApplicationIsInstalled()
{
    const Outcome outcome = run({});
    QCOMPARE(outcome.status, 1);
    QCOMPARE(outcome.errors.count('\n'), 1);
    QCOMPARE(outcome.errors, QByteArray("vel-menusync: no application is installed\n"));
    QVERIFY(!QFile::exists(path(QStringLiteral("config"))));
}

void tst_vel_menusync::tellsWhyTheMenuCannotBeUpdated_data()
{
    QTest::addColumn<QString>("closed");
    QTest::addColumn<bool>("hasMenu");
    QTest::addColumn<QByteArray>("reason");
    QTest::newRow("no new menu") << "config/vel" << false << QByteArray("Permission denied");
    QTest::newRow("no memory") << "config/vel" << true << QByteArray("Permission denied");
    QTest::newRow("no new entry") << "config/vel/startmenu/Game" << true << QByteArray("Permission denied");
    QTest::newRow("no new folder") << "config/vel/startmenu" << true << QByteArray("Permission denied");
    QTest::newRow("a file in the way") << "" << false << QByteArray("Not a directory");
}

void tst_vel_menusync::tellsWhyTheMenuCannotBeUpdated()
{
    QFETCH(QString, closed);
    QFETCH(bool, hasMenu);
    QFETCH(QByteArray, reason);
    if (closed.isEmpty())
        write(QStringLiteral("config/vel/startmenu"), "in the way");
    install(QStringLiteral("a.desktop"), "Game;");
    QDir().mkpath(path(QStringLiteral("config/vel")));
    if (hasMenu)
        QCOMPARE(run({}).status, 0);
    install(QStringLiteral("b.desktop"), "Game;");
    install(QStringLiteral("c.desktop"), "Office;");
    Outcome outcome;
    if (!closed.isEmpty())
        QVERIFY(QFile::setPermissions(path(closed), QFile::ReadOwner | QFile::ExeOwner));
    {
        const OrdinaryUser user(folder());
        outcome = run({});
    }
    if (!closed.isEmpty())
        QVERIFY(QFile::setPermissions(path(closed), QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner));
    QCOMPARE(outcome.status, 1);
    QCOMPARE(outcome.errors,
             "vel-menusync: cannot update the start menu " + QFile::encodeName(menu()) + ": " + reason
                 + '\n');
}

void tst_vel_menusync::tellsOnceInAWatchWhatIsWrong()
{
    QDir().mkpath(path(QStringLiteral("home/applications")));
    QProcess program;
    watch(program);
    QByteArray errors;
    const auto hasSaid = [&](const QByteArray &text) {
        errors += program.readAllStandardError();
        return errors == text;
    };
    const QByteArray text = "vel-menusync: no application is installed\n";
    TRY_VERIFY(hasSaid(text));
    write(QStringLiteral("home/applications/no-entry"), "x");
    install(QStringLiteral("a.desktop"), "Game;");
    TRY_VERIFY(shows("Game/a.desktop"));
    uninstall(QStringLiteral("a.desktop"));
    TRY_VERIFY(hasSaid(text + text));
    program.terminate();
    QVERIFY(program.waitForFinished(20000));
}

void tst_vel_menusync::updatesTheMenuOnce()
{
    install(QStringLiteral("a.desktop"), "Game;");
    QCOMPARE(run({}).status, 0);
    QVERIFY(shows("Game/a.desktop"));
    install(QStringLiteral("b.desktop"), "Game;");
    const Outcome outcome = run({});
    QCOMPARE(outcome.status, 0);
    QCOMPARE(outcome.out + outcome.errors, QByteArray());
    QVERIFY(shows("Game/b.desktop"));
}

void tst_vel_menusync::updatesAnotherMenu()
{
    install(QStringLiteral("a.desktop"), "Game;");
    QCOMPARE(run({path(QStringLiteral("other"))}).status, 0);
    QVERIFY(QFile::exists(path(QStringLiteral("other/Game/a.desktop"))));
    QVERIFY(!QFile::exists(menu()));
}

void tst_vel_menusync::tellsTheWindowManagerOfAChange()
{
    CommandChannel channel;
    install(QStringLiteral("a.desktop"), "Game;");
    QCOMPARE(run({}).status, 0);
    QCOMPARE(channel.bytes(), QByteArray("VELWM_UPDATE_STARTMENU\n"));
    QCOMPARE(run({}).status, 0);
    QCOMPARE(run({path(QStringLiteral("other"))}).status, 0);
    QCOMPARE(channel.bytes(), QByteArray("VELWM_UPDATE_STARTMENU\n"));
}

void tst_vel_menusync::updatesTheMenuAtTheBeginningOfAWatch()
{
    install(QStringLiteral("a.desktop"), "Game;");
    QProcess program;
    watch(program);
    TRY_VERIFY(shows("Game/a.desktop"));
    QVERIFY(program.state() == QProcess::Running);
    program.terminate();
    QVERIFY(program.waitForFinished());
}

void tst_vel_menusync::showsWhatIsInstalledMeanwhile()
{
    install(QStringLiteral("a.desktop"), "Game;");
    QProcess program;
    watch(program);
    TRY_VERIFY(shows("Game/a.desktop"));
    for (int i = 0; i < 3; ++i) {
        install(QStringLiteral("b%1.desktop").arg(i), "Office;");
        TRY_VERIFY(shows(("Office/b" + QByteArray::number(i) + ".desktop").constData()));
    }
    program.terminate();
    QVERIFY(program.waitForFinished());
}

void tst_vel_menusync::showsWhatIsWrittenInPlace()
{
    install(QStringLiteral("a.desktop"), "Game;");
    QProcess program;
    watch(program);
    TRY_VERIFY(shows("Game/a.desktop"));
    QTest::qWait(4000); // the folder is quiet, its times tell nothing
    install(QStringLiteral("a.desktop"), "Game;", "Comment=new\n");
    TRY_VERIFY(read(inMenu(QStringLiteral("Game/a.desktop"))).contains("Comment=new"));
    program.terminate();
    QVERIFY(program.waitForFinished());
}

void tst_vel_menusync::removesWhatIsRemovedMeanwhile()
{
    install(QStringLiteral("a.desktop"), "Game;");
    install(QStringLiteral("b.desktop"), "Game;");
    QProcess program;
    watch(program);
    TRY_VERIFY(shows("Game/b.desktop"));
    uninstall(QStringLiteral("b.desktop"));
    TRY_VERIFY(!shows("Game/b.desktop"));
    program.terminate();
    QVERIFY(program.waitForFinished());
}

void tst_vel_menusync::followsFoldersThatComeLater()
{
    install(QStringLiteral("a.desktop"), "Game;");
    QProcess program;
    watch(program);
    TRY_VERIFY(shows("Game/a.desktop"));
    install(QStringLiteral("one/two/b.desktop"), "Game;");
    TRY_VERIFY(shows("Game/b.desktop"));
    install(QStringLiteral("one/two/c.desktop"), "Game;");
    TRY_VERIFY(shows("Game/c.desktop"));
    // Neither "system" nor "system/applications" exist yet.
    const QByteArray entry = "[Desktop Entry]\nType=Application\nName=x\nExec=true\nCategories=Office;\n";
    write(QStringLiteral("system/applications/d.desktop"), entry);
    TRY_VERIFY(shows("Office/d.desktop"));
    write(QStringLiteral("system/applications/e.desktop"), entry);
    TRY_VERIFY(shows("Office/e.desktop"));
    // A folder that goes and comes again.
    QVERIFY(QDir(path(QStringLiteral("system"))).removeRecursively());
    TRY_VERIFY(!shows("Office/d.desktop"));
    write(QStringLiteral("system/applications/d.desktop"), entry);
    TRY_VERIFY(shows("Office/d.desktop"));
    program.terminate();
    QVERIFY(program.waitForFinished());
}

void tst_vel_menusync::endsWhenItIsTold_data()
{
    QTest::addColumn<int>("signal");
    QTest::newRow("SIGTERM") << SIGTERM;
    QTest::newRow("SIGINT") << SIGINT;
    QTest::newRow("SIGHUP") << SIGHUP;
}

void tst_vel_menusync::endsWhenItIsTold()
{
    QFETCH(int, signal);
    install(QStringLiteral("a.desktop"), "Game;");
    QProcess program;
    watch(program);
    TRY_VERIFY(shows("Game/a.desktop"));
    QCOMPARE(::kill(pid_t(program.processId()), signal), 0);
    QVERIFY(program.waitForFinished());
    QCOMPARE(int(program.exitStatus()), int(QProcess::NormalExit));
    QCOMPARE(program.exitCode(), 0);
    QCOMPARE(program.readAllStandardError(), QByteArray());
}

void tst_vel_menusync::theFilesOfTheSessionStartAWatch_data()
{
    QTest::addColumn<QString>("file");
    QTest::addColumn<QByteArray>("line");
    QTest::newRow("unit of systemd") << QStringLiteral(VEL_UNIT)
                                     << QByteArray("ExecStart=" VEL_BIN_DIR "/vel-menusync --watch");
    QTest::newRow("autostart") << QStringLiteral(VEL_AUTOSTART) << QByteArray("Exec=vel-menusync --watch");
}

void tst_vel_menusync::theFilesOfTheSessionStartAWatch()
{
    QFETCH(QString, file);
    QFETCH(QByteArray, line);
    QVERIFY2(read(file).split('\n').contains(line), read(file).constData());
}

VEL_TEST_GUILESS_MAIN(tst_vel_menusync)
#include "tst_vel_menusync.moc"
