// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "OrdinaryUser.h"
#include "TestCase.h"

#include <QProcess>
#include <QProcessEnvironment>
#include <QStandardPaths>

// Last: the macros of Xlib's header hide names of Qt.
#include "CommandChannel.h"

/// The program as a user runs it.
class tst_vel_menuedit : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void showsHelpAndVersionWithoutADisplay_data();
    void showsHelpAndVersionWithoutADisplay();
    void refusesWhatItDoesNotUnderstand_data();
    void refusesWhatItDoesNotUnderstand();
    void refusesDirectoriesThatItCannotShow_data();
    void refusesDirectoriesThatItCannotShow();
    void createsTheStartMenuOnFirstUse();
    void beginsWithAnEmptyStartMenuWithoutApplications();
    void failsWhenTheStartMenuCannotBeCreated();
    void leavesAStartMenuThatIsThere();
    void showsWhatWasInstalledSince();
    void tellsTheWindowManagerWhenItCloses_data();
    void tellsTheWindowManagerWhenItCloses();
    void closesQuietlyWhenNobodyIsTold();
    void leavesTheChannelToAWindowManagerThatComesLater();
    void picksAnEntry_data();
    void picksAnEntry();
    void picksNothingWhenCanceled();
    void showsTheDirectoryGivenUnderItsName();
    void editsUnlessToldToLookOnly_data();
    void editsUnlessToldToLookOnly();
    void hasOneButtonToCloseUnlessItPicks_data();
    void hasOneButtonToCloseUnlessItPicks();
    void opensTheHelpOnF1();
    void hasAValidDesktopEntry();

private:
    /// What a run ended with.
    struct Outcome
    {
        int status = -1;
        QByteArray output;
        QByteArray errors;
    };

    Outcome run(const QStringList &arguments);
    void start(QProcess &program, const QStringList &arguments);
    bool finish(QProcess &program);
    static QByteArray tool(const QString &name, const QStringList &arguments);
    static QByteArray windowNamed(const QString &pattern);
    QString titleOf(const QString &dir);
    static void press(const QByteArray &window, const QString &keys);
    QString standardDir(const char *name) { return path(QStringLiteral("config/")) + QLatin1String(name); }

    QProcessEnvironment m_environment;
};

void tst_vel_menuedit::init()
{
    TestCase::init();
    m_environment = QProcessEnvironment::systemEnvironment();
    m_environment.insert(QStringLiteral("VEL_CONFIG_HOME"), path(QStringLiteral("config")));
    m_environment.insert(QStringLiteral("XDG_DATA_DIRS"), path(QStringLiteral("data")));
    write(QStringLiteral("data/applications/x.desktop"),
          "[Desktop Entry]\nType=Application\nName=Xylophone\nExec=true %f\nCategories=Game;\n");
}

tst_vel_menuedit::Outcome tst_vel_menuedit::run(const QStringList &arguments)
{
    QProcess program;
    start(program, arguments);
    program.waitForFinished(20000);
    return {program.exitCode(), program.readAllStandardOutput(), program.readAllStandardError()};
}

void tst_vel_menuedit::start(QProcess &program, const QStringList &arguments)
{
    program.setProcessEnvironment(m_environment);
    program.start(QStringLiteral(VEL_MENUEDIT), arguments);
    QVERIFY(program.waitForStarted());
}

bool tst_vel_menuedit::finish(QProcess &program)
{
    return program.state() == QProcess::NotRunning || program.waitForFinished(20000);
}

QByteArray tst_vel_menuedit::tool(const QString &name, const QStringList &arguments)
{
    QProcess process;
    process.start(name, arguments);
    process.waitForFinished(20000);
    return process.readAllStandardOutput().trimmed();
}

// As a pattern.
QString tst_vel_menuedit::titleOf(const QString &dir)
{
    return dir == standardDir("startmenu") ? QStringLiteral("^Start menu$")
                                           : QLatin1Char('^') + QFileInfo(dir).fileName() + QLatin1Char('$');
}

QByteArray tst_vel_menuedit::windowNamed(const QString &pattern)
{
    const QStringList search{QStringLiteral("search"), QStringLiteral("--onlyvisible"),
                             QStringLiteral("--name"), pattern};
    QByteArray window;
    if (!QTest::qWaitFor(
            [&] {
                window = tool(QStringLiteral("xdotool"), search).split('\n').constFirst();
                return !window.isEmpty();
            },
            20000))
        QTest::qFail(qPrintable(QStringLiteral("no window ") + pattern), __FILE__, __LINE__);
    tool(QStringLiteral("xdotool"),
         {QStringLiteral("windowactivate"), QStringLiteral("--sync"), QString::fromLatin1(window)});
    return window;
}

void tst_vel_menuedit::press(const QByteArray &window, const QString &keys)
{
    Q_UNUSED(window)
    tool(QStringLiteral("xdotool"),
         QStringList{QStringLiteral("key"), QStringLiteral("--clearmodifiers"), QStringLiteral("--delay"),
                     QStringLiteral("60")}
             + keys.split(QLatin1Char(' ')));
}

void tst_vel_menuedit::showsHelpAndVersionWithoutADisplay_data()
{
    QTest::addColumn<QString>("option");
    QTest::addColumn<QByteArray>("text");
    QTest::newRow("--help") << "--help" << QByteArray("--icon-size");
    QTest::newRow("-h") << "-h" << QByteArray("--pick");
    QTest::newRow("--version") << "--version" << QByteArray("vel-menuedit 1.");
    QTest::newRow("-v") << "-v" << QByteArray("vel-menuedit 1.");
}

void tst_vel_menuedit::showsHelpAndVersionWithoutADisplay()
{
    QFETCH(QString, option);
    QFETCH(QByteArray, text);
    m_environment.remove(QStringLiteral("DISPLAY"));
    const Outcome outcome = run({option});
    QCOMPARE(outcome.status, 0);
    QVERIFY2(outcome.output.contains(text), outcome.output.constData());
    QCOMPARE(outcome.errors, QByteArray());
    QVERIFY(!QFile::exists(path(QStringLiteral("config"))));
}

void tst_vel_menuedit::refusesWhatItDoesNotUnderstand_data()
{
    QTest::addColumn<QStringList>("arguments");
    QTest::newRow("option") << QStringList{QStringLiteral("--nonsense")};
    QTest::newRow("argument") << QStringList{QStringLiteral("somewhere")};
    QTest::newRow("two directories") << QStringList{QStringLiteral("--desktop"), QStringLiteral("--toolbar")};
    QTest::newRow("dir and desktop") << QStringList{QStringLiteral("--dir"), QStringLiteral("/"),
                                                    QStringLiteral("--desktop")};
    QTest::newRow("size is no number") << QStringList{QStringLiteral("--icon-size"), QStringLiteral("large")};
    QTest::newRow("size is nothing") << QStringList{QStringLiteral("--icon-size"), QStringLiteral("0")};
    QTest::newRow("size is negative") << QStringList{QStringLiteral("--icon-size=-5")};
    QTest::newRow("size is huge") << QStringList{QStringLiteral("--icon-size"), QStringLiteral("100000")};
}

void tst_vel_menuedit::refusesWhatItDoesNotUnderstand()
{
    QFETCH(QStringList, arguments);
    const Outcome outcome = run(arguments);
    QCOMPARE(outcome.status, 2);
    QVERIFY2(outcome.errors.startsWith("vel-menuedit: ") && outcome.errors.count('\n') == 1,
             outcome.errors.constData());
    QVERIFY(!QFile::exists(path(QStringLiteral("config"))));
}

void tst_vel_menuedit::refusesDirectoriesThatItCannotShow_data()
{
    QTest::addColumn<QStringList>("arguments");
    QTest::addColumn<QByteArray>("error");
    QTest::newRow("missing") << QStringList{QStringLiteral("--dir"), QStringLiteral("@/none")}
                             << QByteArray("no such directory: @/none");
    QTest::newRow("a file") << QStringList{QStringLiteral("--dir"), QStringLiteral("@/file")}
                            << QByteArray("not a directory: @/file");
    QTest::newRow("no path") << QStringList{QStringLiteral("--dir"), QStringLiteral("")}
                             << QByteArray("no such directory: ");
    QTest::newRow("unreadable") << QStringList{QStringLiteral("--dir"), QStringLiteral("@/closed")}
                                << QByteArray("cannot read the directory @/closed");
    QTest::newRow("no tool bar") << QStringList{QStringLiteral("--toolbar")}
                                 << QByteArray("no such directory: @/config/toolbar");
}

void tst_vel_menuedit::refusesDirectoriesThatItCannotShow()
{
    QFETCH(QStringList, arguments);
    QFETCH(QByteArray, error);
    write(QStringLiteral("file"), "x");
    const QString closed = path(QStringLiteral("closed"));
    QDir().mkpath(closed);
    QVERIFY(QFile::setPermissions(closed, QFile::Permissions()));
    arguments.replaceInStrings(QStringLiteral("@"), folder());
    Outcome outcome;
    {
        const OrdinaryUser user(folder());
        m_environment.insert(QStringLiteral("XDG_RUNTIME_DIR"), qEnvironmentVariable("XDG_RUNTIME_DIR"));
        outcome = run(arguments);
    }
    QVERIFY(QFile::setPermissions(closed, QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner));
    QCOMPARE(outcome.status, 2);
    QCOMPARE(outcome.errors, "vel-menuedit: " + error.replace("@", QFile::encodeName(folder())) + '\n');
}

void tst_vel_menuedit::createsTheStartMenuOnFirstUse()
{
    CommandChannel channel;
    QProcess program;
    start(program, {});
    const QByteArray window = windowNamed(titleOf(standardDir("startmenu")));
    QVERIFY(QFile::exists(standardDir("startmenu") + QLatin1String("/.directory")));
    press(window, QStringLiteral("Escape"));
    QVERIFY(finish(program));
    QCOMPARE(program.exitCode(), 0);
    QCOMPARE(program.readAllStandardError(), QByteArray());
}

void tst_vel_menuedit::beginsWithAnEmptyStartMenuWithoutApplications()
{
    m_environment.insert(QStringLiteral("XDG_DATA_DIRS"), path(QStringLiteral("none")));
    CommandChannel channel;
    QProcess program;
    start(program, {});
    press(windowNamed(titleOf(standardDir("startmenu"))), QStringLiteral("Escape"));
    QVERIFY(finish(program));
    QCOMPARE(program.exitCode(), 0);
    QCOMPARE(QDir(standardDir("startmenu")).entryList(QDir::AllEntries | QDir::Hidden | QDir::NoDotAndDotDot),
             QStringList());
}

void tst_vel_menuedit::failsWhenTheStartMenuCannotBeCreated()
{
    write(QStringLiteral("config"), "a file in the way");
    const Outcome outcome = run({});
    QCOMPARE(outcome.status, 2);
    QCOMPARE(outcome.errors,
             "vel-menuedit: cannot create the start menu " + QFile::encodeName(standardDir("startmenu"))
                 + '\n');
    QCOMPARE(read(path(QStringLiteral("config"))), QByteArray("a file in the way"));
}

void tst_vel_menuedit::leavesAStartMenuThatIsThere()
{
    write(QStringLiteral("config/startmenu/own.desktop"),
          "[Desktop Entry]\nType=Application\nName=Own\nExec=true\n");
    CommandChannel channel;
    QProcess program;
    start(program, {});
    press(windowNamed(titleOf(standardDir("startmenu"))), QStringLiteral("Escape"));
    QVERIFY(finish(program));
    QCOMPARE(QDir(standardDir("startmenu")).entryList(QDir::AllEntries | QDir::Hidden | QDir::NoDotAndDotDot),
             QStringList{QStringLiteral("own.desktop")});
}

void tst_vel_menuedit::showsWhatWasInstalledSince()
{
    m_environment.insert(QStringLiteral("XDG_DATA_DIRS"), path(QStringLiteral("data")));
    const QByteArray application = "[Desktop Entry]\nType=Application\nName=x\nExec=true\nCategories=Game;\n";
    CommandChannel channel;
    for (const char *name : {"one", "two"}) {
        write(QStringLiteral("data/applications/%1.desktop").arg(QLatin1String(name)), application);
        QProcess program;
        start(program, {});
        press(windowNamed(titleOf(standardDir("startmenu"))), QStringLiteral("Escape"));
        QVERIFY(finish(program));
        QVERIFY(QFile::exists(standardDir("startmenu")
                              + QStringLiteral("/Game/%1.desktop").arg(QLatin1String(name))));
    }
}

void tst_vel_menuedit::tellsTheWindowManagerWhenItCloses_data()
{
    QTest::addColumn<QStringList>("arguments");
    QTest::addColumn<QString>("dir");
    QTest::addColumn<QByteArray>("command");
    QTest::newRow("start menu") << QStringList() << "config/startmenu"
                                << QByteArray("VELWM_UPDATE_STARTMENU\n");
    QTest::newRow("start menu by path")
        << QStringList{QStringLiteral("--dir"), QStringLiteral("@/config/startmenu/")} << "config/startmenu"
        << QByteArray("VELWM_UPDATE_STARTMENU\n");
    QTest::newRow("tool bar") << QStringList{QStringLiteral("--toolbar")} << "config/toolbar"
                              << QByteArray("VELWM_UPDATE_TOOLBAR\n");
    QTest::newRow("desktop") << QStringList{QStringLiteral("--desktop")} << "home/Desktop"
                             << QByteArray("VELWM_UPDATE_SHORTCUT\n");
    QTest::newRow("another") << QStringList{QStringLiteral("--dir"), QStringLiteral("@/other")} << "other"
                             << QByteArray();
}

void tst_vel_menuedit::tellsTheWindowManagerWhenItCloses()
{
    QFETCH(QStringList, arguments);
    QFETCH(QString, dir);
    QFETCH(QByteArray, command);
    m_environment.insert(QStringLiteral("HOME"), path(QStringLiteral("home")));
    m_environment.remove(QStringLiteral("XDG_CONFIG_HOME"));
    QDir().mkpath(path(dir));
    arguments.replaceInStrings(QStringLiteral("@"), folder());
    CommandChannel channel;
    QProcess program;
    start(program, arguments);
    press(windowNamed(titleOf(path(dir))), QStringLiteral("Escape"));
    QVERIFY(finish(program));
    QCOMPARE(program.exitCode(), 0);
    QCOMPARE(channel.bytes(), command);
}

void tst_vel_menuedit::closesQuietlyWhenNobodyIsTold()
{
    QDir().mkpath(standardDir("startmenu"));
    QProcess program;
    start(program, {});
    press(windowNamed(titleOf(standardDir("startmenu"))), QStringLiteral("Escape"));
    // Nothing asks for a further key.
    QVERIFY(finish(program));
    QCOMPARE(program.exitCode(), 0);
    QCOMPARE(program.readAllStandardError(), QByteArray());
}

void tst_vel_menuedit::leavesTheChannelToAWindowManagerThatComesLater()
{
    QDir().mkpath(standardDir("startmenu"));
    QProcess program;
    start(program, {});
    const QByteArray window = windowNamed(titleOf(standardDir("startmenu")));
    QVERIFY(!CommandChannel::isTaken());
    CommandChannel channel;
    press(window, QStringLiteral("Escape"));
    QVERIFY(finish(program));
    QCOMPARE(channel.bytes(), QByteArray("VELWM_UPDATE_STARTMENU\n"));
}

void tst_vel_menuedit::picksAnEntry_data()
{
    QTest::addColumn<QByteArray>("exec");
    QTest::addColumn<QByteArray>("command");
    QTest::newRow("program") << QByteArray("prog %f --end") << QByteArray("prog  --end\n");
    QTest::newRow("function of the window manager")
        << QByteArray("VELWM_QUIT") << QByteArray("vel-wmfunc VELWM_QUIT\n");
}

void tst_vel_menuedit::picksAnEntry()
{
    QFETCH(QByteArray, exec);
    QFETCH(QByteArray, command);
    const QString entry = write(QStringLiteral("menu/my entry.desktop"),
                                "[Desktop Entry]\nType=Application\nName=Mine\nExec=" + exec + '\n');
    QProcess program;
    start(program, {QStringLiteral("--pick"), QStringLiteral("--dir"), path(QStringLiteral("menu"))});
    const QByteArray window = windowNamed(titleOf(path(QStringLiteral("menu"))));
    // The keyboard begins in the tree, on its first item.
    press(window, QStringLiteral("Home space Return"));
    QVERIFY(finish(program));
    QCOMPARE(program.exitCode(), 0);
    QCOMPARE(program.readAllStandardOutput(), QFile::encodeName(entry) + '\n' + command);
}

void tst_vel_menuedit::picksNothingWhenCanceled()
{
    write(QStringLiteral("menu/a.desktop"), "[Desktop Entry]\nType=Application\nName=A\nExec=true\n");
    QProcess program;
    start(program, {QStringLiteral("--pick"), QStringLiteral("--dir"), path(QStringLiteral("menu"))});
    press(windowNamed(titleOf(path(QStringLiteral("menu")))), QStringLiteral("Home space Escape"));
    QVERIFY(finish(program));
    QCOMPARE(program.exitCode(), 1);
    QCOMPARE(program.readAllStandardOutput(), QByteArray());
}

void tst_vel_menuedit::showsTheDirectoryGivenUnderItsName()
{
    write(QStringLiteral("menu/.directory"), "[Desktop Entry]\nType=Directory\nName=X\nName[en]=Named\n");
    QProcess program;
    program.setWorkingDirectory(folder());
    start(program,
          {QStringLiteral("--dir"), QStringLiteral("menu/../menu"), QStringLiteral("--icon-size"),
           QStringLiteral("32")});
    press(windowNamed(QStringLiteral("^Named$")), QStringLiteral("Escape"));
    QVERIFY(finish(program));
}

void tst_vel_menuedit::editsUnlessToldToLookOnly_data()
{
    QTest::addColumn<bool>("readOnly");
    QTest::newRow("edit") << false;
    QTest::newRow("look") << true;
}

void tst_vel_menuedit::editsUnlessToldToLookOnly()
{
    QFETCH(bool, readOnly);
    // A single item would be the current one without being selected.
    write(QStringLiteral("menu/a.desktop"), "[Desktop Entry]\nType=Application\nName=A\nExec=true\n");
    write(QStringLiteral("menu/b.desktop"), "[Desktop Entry]\nType=Application\nName=B\nExec=true\n");
    QStringList arguments{QStringLiteral("--dir"), path(QStringLiteral("menu"))};
    if (readOnly)
        arguments.append(QStringLiteral("--read-only"));
    QProcess program;
    start(program, arguments);
    const QByteArray window = windowNamed(titleOf(path(QStringLiteral("menu"))));
    // The keyboard begins in the tree; the keys may come before its rows.
    const auto count = [this] { return QDir(path(QStringLiteral("menu"))).entryList(QDir::Files).size(); };
    for (int attempt = 0; attempt < (readOnly ? 2 : 20); ++attempt) {
        press(window, QStringLiteral("Down Up Delete"));
        if (QTest::qWaitFor([&] { return count() < 2; }, 1000))
            break;
    }
    QCOMPARE(count(), readOnly ? 2 : 1);
    if (!readOnly) {
        press(window, QStringLiteral("ctrl+z"));
        QTRY_COMPARE(count(), 2);
        press(window, QStringLiteral("ctrl+shift+z"));
        QTRY_COMPARE(count(), 1);
    }
    press(windowNamed(titleOf(path(QStringLiteral("menu")))), QStringLiteral("Escape"));
    QVERIFY(finish(program));
    QCOMPARE(QDir(path(QStringLiteral("menu"))).entryList(QDir::Files).size(), readOnly ? 2 : 1);
}

void tst_vel_menuedit::hasOneButtonToCloseUnlessItPicks_data()
{
    QTest::addColumn<bool>("pick");
    QTest::newRow("edit") << false;
    QTest::newRow("pick") << true;
}

// From the tree the focus goes past one button to the tool bar, whose first button makes an entry, or to
// the second button.
void tst_vel_menuedit::hasOneButtonToCloseUnlessItPicks()
{
    QFETCH(bool, pick);
    for (const char *name : {"a", "b"})
        write(QStringLiteral("menu/%1.desktop").arg(QLatin1String(name)),
              "[Desktop Entry]\nType=Application\nName=N\nExec=true\n");
    QStringList arguments{QStringLiteral("--dir"), path(QStringLiteral("menu"))};
    if (pick)
        arguments.append(QStringLiteral("--pick"));
    QProcess program;
    start(program, arguments);
    const QByteArray window = windowNamed(titleOf(path(QStringLiteral("menu"))));
    const QStringList editor{QStringLiteral("search"), QStringLiteral("--onlyvisible"),
                             QStringLiteral("--name"), QStringLiteral("^Desktop Entry ")};
    const auto isEdited = [&editor] { return !tool(QStringLiteral("xdotool"), editor).isEmpty(); };
    // The keys may come before the rows.
    for (int attempt = 0; attempt < 20; ++attempt) {
        press(window, QStringLiteral("Down Up Tab Tab space"));
        if (QTest::qWaitFor([&] { return isEdited() || program.state() == QProcess::NotRunning; }, 1000))
            break;
    }
    QCOMPARE(isEdited(), !pick);
    if (!pick) {
        press(windowNamed(editor.constLast()), QStringLiteral("Escape"));
        press(windowNamed(titleOf(path(QStringLiteral("menu")))), QStringLiteral("shift+Tab space"));
    }
    QVERIFY(finish(program));
    QCOMPARE(program.exitCode(), pick ? 1 : 0);
    QCOMPARE(program.readAllStandardOutput(), QByteArray());
}

void tst_vel_menuedit::opensTheHelpOnF1()
{
    const QString log = path(QStringLiteral("log"));
    const QString opener = write(QStringLiteral("bin/xdg-open"),
                                 "#!/bin/sh\necho \"$1\" >'" + QFile::encodeName(log) + ".part'\nmv '"
                                     + QFile::encodeName(log) + ".part' '" + QFile::encodeName(log) + "'\n");
    QVERIFY(QFile::setPermissions(opener, QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner));
    write(QStringLiteral("data/doc/index.html"), "<html></html>");
    QDir().mkpath(path(QStringLiteral("menu")));
    m_environment.insert(QStringLiteral("PATH"),
                         path(QStringLiteral("bin")) + QLatin1Char(':')
                             + m_environment.value(QStringLiteral("PATH")));
    m_environment.insert(QStringLiteral("VEL_DATA_DIR"), path(QStringLiteral("data")));
    QProcess program;
    start(program, {QStringLiteral("--dir"), path(QStringLiteral("menu"))});
    const QByteArray window = windowNamed(titleOf(path(QStringLiteral("menu"))));
    press(window, QStringLiteral("F1"));
    QTRY_VERIFY_WITH_TIMEOUT(QFile::exists(log), 20000);
    QVERIFY(read(log).contains("data/doc/index.html"));
    press(window, QStringLiteral("Escape"));
    QVERIFY(finish(program));
}

void tst_vel_menuedit::hasAValidDesktopEntry()
{
    const QString validator = QStandardPaths::findExecutable(QStringLiteral("desktop-file-validate"));
    if (validator.isEmpty())
        QSKIP("desktop-file-validate is not installed");
    QCOMPARE(tool(validator, {QStringLiteral(VEL_MENUEDIT_DESKTOP)}), QByteArray());
    const QByteArray text = read(QStringLiteral(VEL_MENUEDIT_DESKTOP));
    QVERIFY(text.contains("\nExec=vel-menuedit\n"));
    QVERIFY(text.contains("\nIcon=velmenuedit\n"));
}

VEL_TEST_MAIN(tst_vel_menuedit)
#include "tst_vel_menuedit.moc"
