// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <desktopentry/ExecProgram.h>
#include <frame/DesktopEntryRecord.h>

#include <QProcess>

using namespace VelUI;

class tst_ExecProgram : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void quotesWhatIsReserved_data();
    void quotesWhatIsReserved();
    void isRunAsTheProgramThatItIs_data();
    void isRunAsTheProgramThatItIs();
    void leavesTheArgumentsAlone_data();
    void leavesTheArgumentsAlone();
};

void tst_ExecProgram::quotesWhatIsReserved_data()
{
    QTest::addColumn<QString>("word");
    QTest::addColumn<QString>("quoted");
    QTest::newRow("plain") << "/usr/bin/gimp-2.10"
                           << "/usr/bin/gimp-2.10";
    QTest::newRow("blank") << "my program"
                           << "\"my program\"";
    QTest::newRow("quotes") << "a\"b'c"
                            << "\"a\\\"b'c\"";
    QTest::newRow("dollar and backtick") << "$a`b"
                                         << "\"\\$a\\`b\"";
    QTest::newRow("backslash") << "a\\b"
                               << "\"a\\\\b\"";
    QTest::newRow("percent") << "100%"
                             << "100%%";
    QTest::newRow("parenthesis") << "a(1)"
                                 << "\"a(1)\"";
    QTest::newRow("letters of other scripts") << QStringLiteral("\u00fcber") << QStringLiteral("\u00fcber");
}

void tst_ExecProgram::quotesWhatIsReserved()
{
    QFETCH(QString, word);
    QFETCH(QString, quoted);
    QCOMPARE(ExecProgram::replaced(QStringLiteral("x -y"), word), quoted + QStringLiteral(" -y"));
}

void tst_ExecProgram::isRunAsTheProgramThatItIs_data()
{
    QTest::addColumn<QString>("name");
    for (const char *name : {"plain", "with blank", "a\"b", "a'b", "$HOME", "`id`", "back\\slash", "100%f",
                             "a;b", "a&b|c", "*", "#1", "<>", "(x)", "~"})
        QTest::newRow(name) << QString::fromLatin1(name);
}

void tst_ExecProgram::isRunAsTheProgramThatItIs()
{
    QFETCH(QString, name);
    const QString program = write(name, "#!/bin/sh\necho it was me\n");
    QVERIFY(QFile::setPermissions(program, QFile::ReadOwner | QFile::ExeOwner));
    const QString exec = ExecProgram::replaced(QStringLiteral("other"), program);
    const QString line = VelUIDesktopEntry::ExecFormatString(exec);
    QProcess shell;
    shell.start(QStringLiteral("/bin/sh"), {QStringLiteral("-c"), line});
    QVERIFY(shell.waitForFinished());
    QCOMPARE(shell.readAllStandardOutput(), QByteArray("it was me\n"));
}

void tst_ExecProgram::leavesTheArgumentsAlone_data()
{
    QTest::addColumn<QString>("command");
    QTest::addColumn<QString>("replaced");
    QTest::newRow("nothing") << ""
                             << "new";
    QTest::newRow("blanks") << "  "
                            << "  new";
    QTest::newRow("program alone") << "old"
                                   << "new";
    QTest::newRow("arguments") << "old  --a=\"b c\" %U "
                               << "new  --a=\"b c\" %U ";
    QTest::newRow("double quotes") << "\"old one\\\"s\" %f"
                                   << "new %f";
    QTest::newRow("single quotes") << "'old \\' %f"
                                   << "new %f";
    QTest::newRow("backslash") << "old\\ one %f"
                               << "new %f";
    QTest::newRow("quotes in the middle") << "a\"b c\"d e"
                                          << "new e";
    QTest::newRow("open quote") << "\"old one"
                                << "new";
    QTest::newRow("backslash at the end") << "old\\"
                                          << "new";
    QTest::newRow("blank in front") << " old a"
                                    << " new a";
}

void tst_ExecProgram::leavesTheArgumentsAlone()
{
    QFETCH(QString, command);
    QFETCH(QString, replaced);
    QCOMPARE(ExecProgram::replaced(command, QStringLiteral("new")), replaced);
}

VEL_TEST_GUILESS_MAIN(tst_ExecProgram)

#include "tst_ExecProgram.moc"
