// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <EntryChecks.h>
#include <EntryDocument.h>
#include <ExecLine.h>

/// Command lines of entries, and what speaks against an entry.
class tst_ExecLine : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void findsTheProgram_data();
    void findsTheProgram();
    void quotesForThePlace_data();
    void quotesForThePlace();
    void tellsWhyAnEntryIsUnsuitable_data();
    void tellsWhyAnEntryIsUnsuitable();
    void tellsWhyAnEntryIsNotDisplayed_data();
    void tellsWhyAnEntryIsNotDisplayed();

private:
    EntryDocument document(const QByteArray &keys);
};

void tst_ExecLine::findsTheProgram_data()
{
    QTest::addColumn<QString>("exec");
    QTest::addColumn<QString>("program");
    const QString none = QStringLiteral("(none)");
    QTest::newRow("alone") << QStringLiteral("vi") << QStringLiteral("vi");
    QTest::newRow("with arguments") << QStringLiteral(" vi \"%f\" x") << QStringLiteral("vi");
    QTest::newRow("in quotes") << QStringLiteral("\"my prog\" %u") << QStringLiteral("my prog");
    QTest::newRow("in single quotes") << QStringLiteral("'my\\ prog'") << QStringLiteral("my\\ prog");
    QTest::newRow("quoted in part") << QStringLiteral("my\" \"prog x") << QStringLiteral("my prog");
    QTest::newRow("with an escape") << QStringLiteral("my\\ prog") << QStringLiteral("my prog");
    QTest::newRow("with a percent sign") << QStringLiteral("a%%b") << QStringLiteral("a%b");
    QTest::newRow("empty") << QString() << QString();
    QTest::newRow("an open quote") << QStringLiteral("\"vi") << none;
    QTest::newRow("an open escape") << QStringLiteral("vi\\") << none;
    QTest::newRow("a field code") << QStringLiteral("%f") << none;
    QTest::newRow("an unknown code") << QStringLiteral("vi %y") << none;
}

void tst_ExecLine::findsTheProgram()
{
    QFETCH(QString, exec);
    QFETCH(QString, program);
    QCOMPARE(ExecLine::program(exec).value_or(QStringLiteral("(none)")), program);
}

void tst_ExecLine::quotesForThePlace_data()
{
    QTest::addColumn<QString>("exec");
    QTest::addColumn<QString>("line");
    QTest::newRow("bare") << QStringLiteral("x %f") << QStringLiteral("x 'a $'\\''b'");
    QTest::newRow("in double quotes") << QStringLiteral("x \"%f\"") << QStringLiteral("x \"a \\$'b\"");
    QTest::newRow("in single quotes") << QStringLiteral("x '%f'") << QStringLiteral("x 'a $'\\''b'");
    QTest::newRow("behind a backslash") << QStringLiteral("x \\%f") << QStringLiteral("x \\\\'a $'\\''b'");
    QTest::newRow("nothing given") << QStringLiteral("x %i%k%m") << QStringLiteral("x ");
    QTest::newRow("unknown") << QStringLiteral("x %y") << QString();
}

void tst_ExecLine::quotesForThePlace()
{
    QFETCH(QString, exec);
    QFETCH(QString, line);
    ExecLine::Arguments arguments;
    arguments.filePath = QStringLiteral("a $'b");
    QCOMPARE(ExecLine::expand(exec, arguments), line);
}

EntryDocument tst_ExecLine::document(const QByteArray &keys)
{
    EntryDocument document;
    document.setPath(QFile::encodeName(write(QStringLiteral("x.desktop"), "[Desktop Entry]\n" + keys)));
    if (!document.load())
        QTest::qFail("the entry does not load", __FILE__, __LINE__);
    return document;
}

void tst_ExecLine::tellsWhyAnEntryIsUnsuitable_data()
{
    QTest::addColumn<QByteArray>("keys");
    QTest::addColumn<int>("reason");
    const QByteArray application = "Type=Application\nName=A\n";
    const auto row = [](const char *name, const QByteArray &keys, EntryChecks::Unsuitable reason) {
        QTest::newRow(name) << keys << int(reason);
    };
    row("nothing", application + "Exec=sh -c x\n", EntryChecks::Suitable);
    row("no type", "Name=A\nExec=sh\n", EntryChecks::Unusable);
    row("no command", application, EntryChecks::NoExec);
    row("a command that does not parse", application + "Exec=\"sh\n", EntryChecks::Unusable);
    row("a program that is gone", application + "Exec=/nosuch/x\n", EntryChecks::ProgramMissing);
    row("a program that does not run", application + "Exec=/etc/passwd\n", EntryChecks::ProgramNotExecutable);
    row("a program nobody has", application + "Exec=vel-no-such\n", EntryChecks::ProgramNotInPath);
    row("a test program that is gone", application + "Exec=sh\nTryExec=/nosuch/x\n",
        EntryChecks::TryExecMissing);
    row("a test program nobody has", application + "Exec=sh\nTryExec=vel-no-such\n",
        EntryChecks::TryExecNotInPath);
    row("a link to nowhere", "Type=Link\nName=A\nURL=/nosuch\n", EntryChecks::UrlMissing);
}

void tst_ExecLine::tellsWhyAnEntryIsUnsuitable()
{
    QFETCH(QByteArray, keys);
    QFETCH(int, reason);
    QCOMPARE(int(EntryChecks::suitability(document(keys))), reason);
}

void tst_ExecLine::tellsWhyAnEntryIsNotDisplayed_data()
{
    QTest::addColumn<QByteArray>("keys");
    QTest::addColumn<int>("reason");
    QTest::newRow("nothing") << QByteArray("TryExec=sh\nOnlyShowIn=VEL;\n") << int(EntryChecks::Displayed);
    QTest::newRow("hidden") << QByteArray("NoDisplay=true\nHidden=true\n") << int(EntryChecks::IsHidden);
    QTest::newRow("no menu") << QByteArray("NoDisplay=true\nNotShowIn=VEL;\n")
                             << int(EntryChecks::IsNotForMenus);
    QTest::newRow("others") << QByteArray("NotShowIn=VEL;\nTryExec=vel-no-such\n")
                            << int(EntryChecks::IsForOtherDesktops);
    QTest::newRow("not installed") << QByteArray("TryExec=vel-no-such\n") << int(EntryChecks::NotInstalled);
}

void tst_ExecLine::tellsWhyAnEntryIsNotDisplayed()
{
    QFETCH(QByteArray, keys);
    QFETCH(int, reason);
    qunsetenv("XDG_CURRENT_DESKTOP");
    QCOMPARE(int(EntryChecks::displayability(document(keys))), reason);
}

VEL_TEST_GUILESS_MAIN(tst_ExecLine)

#include "tst_ExecLine.moc"
