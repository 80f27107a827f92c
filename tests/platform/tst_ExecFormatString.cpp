// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <veluiaux/VelUIDesktopEntry.h>

#include <QProcess>
#include <QRandomGenerator>

using ExecFormatString = VelUIDesktopEntry::ExecFormatString;

/// The command line of an entry, and what a shell makes of it.
class tst_ExecFormatString : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void isEmptyWithAnUnknownCode_data();
    void isEmptyWithAnUnknownCode();
    void fillsInTheCodes_data();
    void fillsInTheCodes();
    void copiesWhatIsNoCode_data();
    void copiesWhatIsNoCode();
    void fallsBackWhenNoListIsGiven();
    void insertsInTheQuotingThatTheCodeStandsIn_data();
    void insertsInTheQuotingThatTheCodeStandsIn();
    void isReadBackByAShellWhateverItHolds_data();
    void isReadBackByAShellWhateverItHolds();
    void canBeCopied();
};

namespace {

QString text(const char *utf8)
{
    return QString::fromUtf8(utf8);
}

ExecFormatString filled(const QString &exec)
{
    ExecFormatString line(exec);
    line.filePath(text("/f"))
        .url(text("http://u"))
        .appName(text("My App"))
        .icon(text("ic"))
        .desktopFilePath(text("/k.desktop"))
        .filePathList({text("/1"), text("/2")})
        .urlList({text("u:1"), text("u:2")});
    return line;
}

// The words that a shell reads in a command line, the program's name left out.
QList<QByteArray> shellWords(const QString &line)
{
    QProcess shell;
    shell.start(QStringLiteral("/bin/sh"),
                {QStringLiteral("-c"), QStringLiteral("p() { printf '%s\\0' \"$@\"; }; ") + line});
    if (!shell.waitForFinished() || shell.exitCode() != 0 || !shell.readAllStandardError().isEmpty())
        return {"the shell failed"};
    QList<QByteArray> words = shell.readAllStandardOutput().split('\0');
    words.removeLast();
    return words;
}

} // namespace

void tst_ExecFormatString::isEmptyWithAnUnknownCode_data()
{
    QTest::addColumn<QString>("exec");
    for (const char *exec :
         {"p %x", "p %", "%", "p %f %1", "p \"%x\"", "p '%'", "p % f", "p %\xC3\xA4", "p %%%"})
        QTest::newRow(exec) << text(exec);
}

void tst_ExecFormatString::isEmptyWithAnUnknownCode()
{
    QFETCH(QString, exec);
    QCOMPARE(QString(filled(exec)), QString());
}

void tst_ExecFormatString::fillsInTheCodes_data()
{
    QTest::addColumn<QString>("exec");
    QTest::addColumn<QString>("line");
    QTest::newRow("f") << text("p %f x") << text("p '/f' x");
    QTest::newRow("F") << text("p %F x") << text("p '/1' '/2' x");
    QTest::newRow("u") << text("p %u x") << text("p 'http://u' x");
    QTest::newRow("U") << text("p %U x") << text("p 'u:1' 'u:2' x");
    QTest::newRow("i") << text("p %i x") << text("p '--icon' 'ic' x");
    QTest::newRow("c") << text("p %c x") << text("p 'My App' x");
    QTest::newRow("k") << text("p %k x") << text("p '/k.desktop' x");
    QTest::newRow("percent") << text("p 100%% %%f x") << text("p 100% %f x");
    QTest::newRow("deprecated") << text("p %d%D%n%N%v%m x") << text("p  x");
    QTest::newRow("inside a word") << text("p --file=%f,%u") << text("p --file='/f','http://u'");
    QTest::newRow("twice") << text("p %f %f") << text("p '/f' '/f'");
}

void tst_ExecFormatString::fillsInTheCodes()
{
    QFETCH(QString, exec);
    QFETCH(QString, line);
    QCOMPARE(QString(filled(exec)), line);
}

void tst_ExecFormatString::copiesWhatIsNoCode_data()
{
    QTest::addColumn<QString>("exec");
    for (const char *exec : {"", "p", "  p   -a  'b c'  \"d $E `f`\" \\\\ \\\" > /dev/null; q & # r",
                             "p 'open", "p \"open", "p \\", "env A=b p", "p \"\\\\\" \"\\\"\"", "p\n\tq"})
        QTest::newRow(exec) << text(exec);
}

void tst_ExecFormatString::copiesWhatIsNoCode()
{
    QFETCH(QString, exec);
    QCOMPARE(QString(filled(exec)), exec);
}

void tst_ExecFormatString::fallsBackWhenNoListIsGiven()
{
    const QString exec = text("p %f|%F|%u|%U|%i|%c|%k");
    QCOMPARE(QString(ExecFormatString(exec)), text("p ||||||"));
    QCOMPARE(
        QString(ExecFormatString(exec).filePath(text("/f")).url(text("u:")).filePathList({}).urlList({})),
        text("p '/f'|'/f'|'u:'|'u:'|||"));
    QCOMPARE(QString(ExecFormatString(text("p %u")).filePath(text("/f"))), text("p '/f'"));
    QCOMPARE(QString(ExecFormatString(text("p %f %u")).url(text("u:"))), text("p  'u:'"));
}

void tst_ExecFormatString::insertsInTheQuotingThatTheCodeStandsIn_data()
{
    QTest::addColumn<QString>("exec");
    QTest::addColumn<QString>("line");
    QTest::newRow("double") << text("p \"a %f b\"") << text("p \"a /f b\"");
    QTest::newRow("single") << text("p 'a %f b'") << text("p 'a /f b'");
    QTest::newRow("several in double") << text("p \"%F\"") << text("p \"/1\" \"/2\"");
    QTest::newRow("several in single") << text("p '%U'") << text("p 'u:1' 'u:2'");
    QTest::newRow("after quotes") << text("p \"a\"%f'b'") << text("p \"a\"'/f''b'");
    QTest::newRow("single in double") << text("p \"it's %f\"") << text("p \"it's /f\"");
    QTest::newRow("escaped quote") << text("p \\\"%f \"\\\"%f\"") << text("p \\\"'/f' \"\\\"/f\"");
}

void tst_ExecFormatString::insertsInTheQuotingThatTheCodeStandsIn()
{
    QFETCH(QString, exec);
    QFETCH(QString, line);
    QCOMPARE(QString(filled(exec)), line);
}

void tst_ExecFormatString::isReadBackByAShellWhateverItHolds_data()
{
    QTest::addColumn<QString>("argument");
    for (const char *argument : {"a b",
                                 "it's",
                                 "'",
                                 "''",
                                 "\"",
                                 "\\",
                                 "\\\\",
                                 "\\'",
                                 "$HOME",
                                 "$(touch x)",
                                 "`touch x`",
                                 "a\nb",
                                 "\n",
                                 "-x",
                                 "%f",
                                 "%%",
                                 "a;b&c|d",
                                 "*",
                                 "~",
                                 "!x",
                                 "#x",
                                 "\t",
                                 "\xC3\xA4\xF0\x9F\x98\x80",
                                 "\\$x",
                                 "\"$x\"",
                                 "a\\"})
        QTest::newRow(argument) << text(argument);
    QRandomGenerator random(20);
    const QString alphabet = text("ab '\"\\$`\n%;(){}*?~!#&|<>=\t");
    for (int i = 0; i < 30; ++i) {
        QString argument;
        for (int n = random.bounded(1, 12); n > 0; --n)
            argument += alphabet.at(random.bounded(alphabet.size()));
        QTest::addRow("random %d", i) << argument;
    }
}

void tst_ExecFormatString::isReadBackByAShellWhateverItHolds()
{
    QFETCH(QString, argument);
    const QByteArray bytes = argument.toUtf8();
    const QString exec =
        text("p %f a%f%f \"%f\" \"x %f y\" '%f' 'x %f y' %F \"%F\" '%F' \\\\%f \"\\\\%f\" \\%f \"\\%f\" %i "
             "\"\\\"%c\" '\\'%k");
    ExecFormatString line(exec);
    line.filePath(argument)
        .filePathList({argument, argument})
        .icon(argument)
        .appName(argument)
        .desktopFilePath(argument);
    const QList<QByteArray> words = shellWords(line);
    const QByteArray slash = "\\" + bytes;
    QCOMPARE(words, (QList<QByteArray>{bytes,        "a" + bytes + bytes,
                                       bytes,        "x " + bytes + " y",
                                       bytes,        "x " + bytes + " y",
                                       bytes,        bytes,
                                       bytes,        bytes,
                                       bytes,        bytes,
                                       slash,        slash,
                                       slash,        slash,
                                       "--icon",     bytes,
                                       "\"" + bytes, slash}));
}

void tst_ExecFormatString::canBeCopied()
{
    ExecFormatString line(text("p %f"));
    line.filePath(text("a"));
    ExecFormatString copy(line);
    copy.filePath(text("b"));
    QCOMPARE(QString(line), text("p 'a'"));
    line = copy;
    QCOMPARE(QString(line), text("p 'b'"));
}

VEL_TEST_GUILESS_MAIN(tst_ExecFormatString)

#include "tst_ExecFormatString.moc"
