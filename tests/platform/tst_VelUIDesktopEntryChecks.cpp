// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <veluiaux/VelUIDesktopEntry.h>

#include <QDir>

/// Whether an entry can be used, and whether it is to be shown.
class tst_VelUIDesktopEntryChecks : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();

    void tellsWhyAnEntryCannotBeUsed_data();
    void tellsWhyAnEntryCannotBeUsed();
    void looksForProgramsInPath();
    void tellsWhyAnEntryIsNotShown_data();
    void tellsWhyAnEntryIsNotShown();
    void doesWithoutACode();

private:
    QByteArray m_path;
};

namespace {

const QByteArray Header = "[Desktop Entry]\nName=N\n";
const QByteArray Application = Header + "Type=Application\n";
const QByteArray Link = Header + "Type=Link\n";

} // namespace

void tst_VelUIDesktopEntryChecks::init()
{
    TestCase::init();
    if (m_path.isEmpty())
        m_path = qgetenv("PATH");
    // @ in the rows below.
    QDir().mkpath(path(QStringLiteral("bin/folder")));
    for (const char *name : {"bin/good", "bin/with space", "bin/per%cent"}) {
        const QString program = write(QLatin1String(name), "#!/bin/sh\n");
        QVERIFY(QFile::setPermissions(program, QFile::Permissions(0x7000) | QFile::ReadOther));
    }
    write(QStringLiteral("bin/plain"), "text");
    QVERIFY(QFile::link(QStringLiteral("nowhere"), path(QStringLiteral("bin/dangling"))));
    qputenv(
        "PATH",
        QFile::encodeName(path(QStringLiteral("missing")) + QLatin1Char(':') + path(QStringLiteral("bin"))));
}

void tst_VelUIDesktopEntryChecks::tellsWhyAnEntryCannotBeUsed_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<int>("reason");
    const auto row = [](const char *name, const QByteArray &bytes, int reason) {
        QTest::newRow(name) << bytes << reason;
    };
    row("nothing", "", -1);
    row("no type", Header + "Exec=good\n", -1);
    row("unknown type", Header + "Type=Service\n", -1);
    row("type in other case", Header + "Type=application\nExec=good\n", -1);
    row("no name", "[Desktop Entry]\nType=Application\nExec=good\n", -1);
    row("local name alone", "[Desktop Entry]\nType=Application\nExec=good\nName[en]=N\n", -1);
    row("folder without a name", "[Desktop Entry]\nType=Directory\n", -1);
    row("folder", Header + "Type=Directory\n", 0);

    row("open quote", Application + "Exec=good \"a\n", -1);
    row("open single quote", Application + "Exec=good 'a\n", -1);
    row("unknown field code", Application + "Exec=good %x\n", -1);
    row("field code cut off", Application + "Exec=good %\n", -1);
    row("backslash at the end", Application + "Exec=good \\\\\n", -1);
    row("field code for a program", Application + "Exec=%f\n", -1);
    row("a comment before a field code", Application + "Exec=good # %f\n", -1);
    row("a second command with a field code", Application + "Exec=good; good %u\n", -1);
    row("into a file that is given", Application + "Exec=good >%f\n", -1);
    row("a second command in single quotes", Application + "Exec=good -c 'a;b' %f\n", 0);
    row("a second command without a field code", Application + "Exec=good %f; good\n", 0);
    row("does not parse, before the program is missed", Application + "Exec=nosuch %x\n", -1);

    row("no exec", Application, 1);
    row("empty exec", Application + "Exec=\n", 1);
    row("blank exec", Application + "Exec=\\s\\s\n", 1);
    row("no exec, no name", "[Desktop Entry]\nType=Application\n", 1);
    row("D-Bus without exec", Application + "DBusActivatable=true\n", 0);
    row("D-Bus said no", Application + "DBusActivatable=false\n", 1);
    row("D-Bus without exec but with a try-exec", Application + "DBusActivatable=true\nTryExec=nosuch\n", 6);

    row("path", Application + "Exec=@/bin/good --x %f %%\n", 0);
    row("path with quotes", Application + "Exec=\"@/bin/with space\" \"a b\" 'c\n", -1);
    row("path in quotes", Application + "Exec=\"@/bin/with space\" a\n", 0);
    row("path with escaped blank", Application + "Exec=@/bin/with\\\\ space a\n", 0);
    row("percent in the path", Application + "Exec=@/bin/per%%cent\n", 0);
    row("deprecated code", Application + "Exec=good %d %D %n %N %v %m\n", 0);
    row("missing path", Application + "Exec=@/bin/nosuch\n", 2);
    row("dangling link", Application + "Exec=@/bin/dangling\n", 2);
    row("relative path missing", Application + "Exec=bin/good\n", 2);
    row("relative path from the working folder", Application + "Path=@\nExec=bin/good\n", 0);
    row("no executable", Application + "Exec=@/bin/plain\n", 3);
    row("a folder", Application + "Exec=@/bin/folder\n", 3);
    row("name", Application + "Exec=good\n", 0);
    row("name behind blanks", Application + "Exec=\\s\\tgood\\targ\n", 0);
    row("name in quotes", Application + "Exec=\"go\"'od'\n", 0);
    row("name not in PATH", Application + "Exec=nosuch\n", 4);
    row("name of no executable in PATH", Application + "Exec=plain\n", 4);
    row("name of a folder in PATH", Application + "Exec=folder\n", 4);
    row("empty name", Application + "Exec=\"\" x\n", 4);
    row("window manager command", Application + "Exec=VELWM_QUIT \"%x\n", 0);
    row("nearly a window manager command", Application + "Exec=velwm_QUIT\n", 4);
    row("window manager command with a try-exec", Application + "Exec=VELWM_QUIT\nTryExec=nosuch\n", 6);

    row("try-exec path", Application + "Exec=good\nTryExec=@/bin/good\n", 0);
    row("try-exec path missing", Application + "Exec=good\nTryExec=@/bin/nosuch\n", 5);
    row("try-exec path no executable", Application + "Exec=good\nTryExec=@/bin/plain\n", 5);
    row("try-exec name", Application + "Exec=good\nTryExec=good\n", 0);
    row("try-exec name missing", Application + "Exec=good\nTryExec=nosuch\n", 6);
    row("exec before try-exec", Application + "Exec=nosuch\nTryExec=@/bin/nosuch\n", 4);
    row("try-exec before name", "[Desktop Entry]\nType=Application\nExec=good\nTryExec=nosuch\n", 6);

    row("link without a target", Link, 7);
    row("link without a target and name", "[Desktop Entry]\nType=Link\n", 7);
    row("link to the web", Link + "URL=https://example.org/\n", 0);
    row("link to a host's file", Link + "URL=file://elsewhere/nosuch\n", 0);
    row("link to a file", Link + "URL=file://@/bin/with%20space\n", 0);
    row("link to a file of this host", Link + "URL=file://localhost@/bin/good\n", 0);
    row("link to a missing file", Link + "URL=file://@/nosuch\n", 7);
    row("link to a path", Link + "URL=@/bin\n", 0);
    row("link to a missing path", Link + "URL=@/nosuch\n", 7);
    row("link with a program of no use to it", Link + "URL=@/bin\nExec=nosuch\nTryExec=nosuch\n", 0);
}

void tst_VelUIDesktopEntryChecks::tellsWhyAnEntryCannotBeUsed()
{
    QFETCH(QByteArray, bytes);
    QFETCH(int, reason);
    const VelUIDesktopEntry record(
        write(QStringLiteral("x.desktop"), bytes.replace('@', QFile::encodeName(folder()))));
    VelUIDesktopEntry::SuitableError error = 77;
    QCOMPARE(record.isSuitable(&error), reason == 0);
    QCOMPARE(error, reason);
}

void tst_VelUIDesktopEntryChecks::looksForProgramsInPath()
{
    const VelUIDesktopEntry good(write(QStringLiteral("x.desktop"), Application + "Exec=good\n"));
    const VelUIDesktopEntry shell(write(QStringLiteral("y.desktop"), Application + "Exec=sh\n"));
    QVERIFY(good.isSuitable(nullptr));
    QVERIFY(!shell.isSuitable(nullptr));
    qputenv("PATH", "");
    QVERIFY(!good.isSuitable(nullptr));
    qunsetenv("PATH");
    QVERIFY(shell.isSuitable(nullptr));
}

void tst_VelUIDesktopEntryChecks::tellsWhyAnEntryIsNotShown_data()
{
    QTest::addColumn<QByteArray>("desktops");
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<int>("reason");
    const auto row = [](const char *name, const QByteArray &desktops, const QByteArray &bytes, int reason) {
        QTest::newRow(name) << desktops << bytes << reason;
    };
    row("plain", "", "", 0);
    row("hidden", "", "Hidden=true\nNoDisplay=true\nOnlyShowIn=X;\nTryExec=nosuch\n", 1);
    row("not for menus", "", "Hidden=false\nNoDisplay=true\nOnlyShowIn=X;\nTryExec=nosuch\n", 2);
    row("for another desktop", "", "OnlyShowIn=X;\nTryExec=nosuch\n", 3);
    row("not installed", "", "TryExec=nosuch\n", 4);
    row("not installed, by path", "", "TryExec=@/bin/nosuch\n", 4);
    row("installed", "", "TryExec=@/bin/good\n", 0);

    row("for the usual desktop", "", "OnlyShowIn=X;VEL;\n", 0);
    row("not for the usual desktop", "", "NotShowIn=X;VEL;\n", 3);
    row("not for another desktop", "", "NotShowIn=X;\n", 0);
    row("for none", "", "OnlyShowIn=\n", 0);
    row("named desktop replaces the usual one", "X", "OnlyShowIn=VEL;\n", 3);
    row("named desktop", "X", "OnlyShowIn=X;\n", 0);
    row("case counts", "x", "OnlyShowIn=X;\n", 3);
    row("second of two", "A:B", "OnlyShowIn=B;\n", 0);
    row("first decides: shown", "A:B", "OnlyShowIn=A;\nNotShowIn=B;\n", 0);
    row("first decides: not shown", "A:B", "OnlyShowIn=B;\nNotShowIn=A;\n", 3);
    row("neither", "A:B", "OnlyShowIn=C;\nNotShowIn=D;\n", 3);
    row("neither is shut out", "A:B", "NotShowIn=D;\n", 0);
    row("both lists", "A", "OnlyShowIn=A;\nNotShowIn=A;\n", 0);
    row("empty names", ":A:", "OnlyShowIn=A;\n", 0);
}

void tst_VelUIDesktopEntryChecks::tellsWhyAnEntryIsNotShown()
{
    QFETCH(QByteArray, desktops);
    QFETCH(QByteArray, bytes);
    QFETCH(int, reason);
    qputenv("XDG_CURRENT_DESKTOP", desktops);
    const VelUIDesktopEntry record(
        write(QStringLiteral("x.desktop"), Header + bytes.replace('@', QFile::encodeName(folder()))));
    VelUIDesktopEntry::DisplayableError error = 77;
    QCOMPARE(record.isDisplayable(&error), reason == 0);
    QCOMPARE(error, reason);
    if (desktops.isEmpty()) {
        qunsetenv("XDG_CURRENT_DESKTOP");
        QCOMPARE(record.isDisplayable(&error), reason == 0);
        QCOMPARE(error, reason);
    }
}

void tst_VelUIDesktopEntryChecks::doesWithoutACode()
{
    const VelUIDesktopEntry bad(write(QStringLiteral("x.desktop"), "[Desktop Entry]\nHidden=true\n"));
    QVERIFY(!bad.isSuitable(nullptr));
    QVERIFY(!bad.isDisplayable(nullptr));
    const VelUIDesktopEntry good(write(QStringLiteral("y.desktop"), Application + "Exec=good\n"));
    QVERIFY(good.isSuitable(nullptr));
    QVERIFY(good.isDisplayable(nullptr));
}

VEL_TEST_GUILESS_MAIN(tst_VelUIDesktopEntryChecks)

#include "tst_VelUIDesktopEntryChecks.moc"
