// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <desktopentry/check/ExecFaults.h>
#include <desktopentry/check/ExecRewriting.h>

using namespace ExecRewriting;

/// Commands as users write them, and as the standard has them.
class tst_ExecRewriting : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void readsWords_data();
    void readsWords();
    void quotesWhatNeedsIt_data();
    void quotesWhatNeedsIt();
    void quotesWordsOfACommand_data();
    void quotesWordsOfACommand();
    void leavesToAShellWhatOnlyAShellCanDo_data();
    void leavesToAShellWhatOnlyAShellCanDo();
    void makesPlainPercents_data();
    void makesPlainPercents();
    void takesCodesOut_data();
    void takesCodesOut();
    void findsFaults_data();
    void findsFaults();
};

void tst_ExecRewriting::readsWords_data()
{
    QTest::addColumn<QString>("exec");
    QTest::addColumn<QStringList>("meant");
    QTest::newRow("nothing") << "" << QStringList();
    QTest::newRow("blanks") << "  " << QStringList();
    QTest::newRow("plain") << "a  b\tc"
                           << QStringList{QStringLiteral("a"), QStringLiteral("b"), QStringLiteral("c")};
    QTest::newRow("double quotes") << "a \"b c\"d"
                                   << QStringList{QStringLiteral("a"), QStringLiteral("b cd")};
    QTest::newRow("single quotes") << "a 'b \"c'"
                                   << QStringList{QStringLiteral("a"), QStringLiteral("b \"c")};
    QTest::newRow("lonely single quote")
        << "a don't" << QStringList{QStringLiteral("a"), QStringLiteral("don't")};
    QTest::newRow("escapes") << "a\\ b \"c\\\"\\d\""
                             << QStringList{QStringLiteral("a b"), QStringLiteral("c\"\\d")};
    QTest::newRow("open quote") << "a \"b c" << QStringList{QStringLiteral("a"), QStringLiteral("b c")};
    QTest::newRow("open escape") << "a\\" << QStringList{QStringLiteral("a\\")};
    QTest::newRow("codes") << "a %f %\" b\""
                           << QStringList{QStringLiteral("a"), QStringLiteral("%f"), QStringLiteral("% b")};
    QTest::newRow("empty word") << "\"\" a" << QStringList{QString(QStringLiteral("")), QStringLiteral("a")};
}

void tst_ExecRewriting::readsWords()
{
    QFETCH(QString, exec);
    QStringList meant;
    for (const Word &word : words(exec))
        meant.append(word.meant);
    QTEST(meant, "meant");
}

void tst_ExecRewriting::quotesWhatNeedsIt_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<QString>("written");
    QTest::newRow("plain") << "a-b_c.d/e"
                           << "a-b_c.d/e";
    QTest::newRow("empty") << ""
                           << "\"\"";
    QTest::newRow("blank") << "a b"
                           << "\"a b\"";
    QTest::newRow("single quote") << "don't"
                                  << "\"don't\"";
    QTest::newRow("protected ones") << "\"`$\\"
                                    << "\"\\\"\\`\\$\\\\\"";
    QTest::newRow("code") << "%f"
                          << "%f";
    QTest::newRow("other languages") << QStringLiteral("Ä日") << QStringLiteral("Ä日");
}

void tst_ExecRewriting::quotesWhatNeedsIt()
{
    QFETCH(QString, text);
    QTEST(quoted(text), "written");
    const QVector<Word> back = words(quoted(text));
    QCOMPARE(back.size(), 1);
    QCOMPARE(back.constFirst().meant, text);
    QVERIFY(back.constFirst().isPlain);
}

void tst_ExecRewriting::quotesWordsOfACommand_data()
{
    QTest::addColumn<QString>("exec");
    QTest::addColumn<QString>("better");
    QTest::newRow("nothing to do") << "a  \"b c\" %f"
                                   << "a  \"b c\" %f";
    QTest::newRow("single quotes") << "sh -c 'echo \"$x\"'"
                                   << "sh -c \"echo \\\"\\$x\\\"\"";
    QTest::newRow("open quote") << "a \"b c"
                                << "a \"b c\"";
    QTest::newRow("needless quote") << "a \"b"
                                    << "a b";
    QTest::newRow("backslash") << "/opt/My\\ App/run %f"
                               << "\"/opt/My App/run\" %f";
    QTest::newRow("address") << "a http://x?a=b&c"
                             << "a \"http://x?a=b&c\"";
    QTest::newRow("home") << "~/bin/a ~ a~"
                          << "/home/me/bin/a /home/me \"a~\"";
    QTest::newRow("apostrophe") << "a don't"
                                << "a \"don't\"";
    QTest::newRow("percent before the quote") << "a \"b 5%"
                                              << "a \"b 5%%\"";
    QTest::newRow("two of them") << "a \"b 5%%"
                                 << "a \"b 5%%\"";
    QTest::newRow("unprotected in quotes") << "a \"5$\""
                                           << "a \"5\\$\"";
    QTest::newRow("unknown escape in quotes") << "a \"\\b\""
                                              << "a \"\\\\b\"";
}

void tst_ExecRewriting::quotesWordsOfACommand()
{
    QFETCH(QString, exec);
    const QString better = requoted(exec, QStringLiteral("/home/me"));
    QTEST(better, "better");
    QCOMPARE(requoted(better, QStringLiteral("/home/me")), better);
}

void tst_ExecRewriting::leavesToAShellWhatOnlyAShellCanDo_data()
{
    QTest::addColumn<QString>("exec");
    QTest::addColumn<bool>("needs");
    QTest::addColumn<QString>("command");
    QTest::newRow("plain") << "a b" << false << "sh -c \"a b\"";
    QTest::newRow("pipe") << "a | b" << true << "sh -c \"a | b\"";
    QTest::newRow("two commands") << "a; b" << true << "sh -c \"a; b\"";
    QTest::newRow("variable") << "a $HOME/b" << true << "sh -c \"a \\$HOME/b\"";
    QTest::newRow("variable in quotes") << "a \"$HOME\"" << true << "sh -c \"a \\\"\\$HOME\\\"\"";
    QTest::newRow("command in a command") << "a `b`" << true << "sh -c \"a \\`b\\`\"";
    QTest::newRow("output") << "a > b" << true << "sh -c \"a > b\"";
    QTest::newRow("with a file") << "a | b %f" << true << "";
    QTest::newRow("address") << "a x?b=c&d=e" << false << "sh -c \"a x?b=c&d=e\"";
    QTest::newRow("price") << "a 5$" << false << "sh -c \"a 5\\$\"";
}

void tst_ExecRewriting::leavesToAShellWhatOnlyAShellCanDo()
{
    QFETCH(QString, exec);
    QTEST(needsShell(exec), "needs");
    QTEST(throughShell(exec), "command");
}

void tst_ExecRewriting::makesPlainPercents_data()
{
    QTest::addColumn<QString>("exec");
    QTest::addColumn<QString>("better");
    QTest::newRow("none") << "a b"
                          << "a b";
    QTest::newRow("codes") << "a %f %% %d"
                           << "a %f %% %d";
    QTest::newRow("at the end") << "a 5%"
                                << "a 5%%";
    QTest::newRow("unknown ones") << "a %x%1 \"%\""
                                  << "a %%x%%1 \"%%\"";
}

void tst_ExecRewriting::makesPlainPercents()
{
    QFETCH(QString, exec);
    QTEST(withPlainPercents(exec), "better");
}

void tst_ExecRewriting::takesCodesOut_data()
{
    QTest::addColumn<QString>("exec");
    QTest::addColumn<QString>("codes");
    QTest::addColumn<QString>("once");
    QTest::addColumn<QString>("better");
    QTest::newRow("none") << "a %f"
                          << "d"
                          << ""
                          << "a %f";
    QTest::newRow("words") << "a %d %f %d"
                           << "d"
                           << ""
                           << "a %f";
    QTest::newRow("in quotes") << "a \"%d\" b"
                               << "d"
                               << ""
                               << "a b";
    QTest::newRow("parts of a word") << "a x%dy \"b %d\""
                                     << "d"
                                     << ""
                                     << "a xy \"b \"";
    QTest::newRow("all but the first") << "a %f %F b%u %U"
                                       << ""
                                       << "fFuU"
                                       << "a %f b";
    QTest::newRow("percent signs") << "a %%f %f"
                                   << ""
                                   << "f"
                                   << "a %%f %f";
    QTest::newRow("alone") << "%d"
                           << "d"
                           << ""
                           << "";
}

void tst_ExecRewriting::takesCodesOut()
{
    QFETCH(QString, exec);
    QFETCH(QString, codes);
    QFETCH(QString, once);
    QTEST(withoutCodes(exec, codes, once), "better");
}

void tst_ExecRewriting::findsFaults_data()
{
    QTest::addColumn<QByteArray>("value");
    QTest::addColumn<QVector<int>>("problems");
    using P = EntryProblem;
    const auto row = [](const char *value, std::initializer_list<P> problems) {
        QVector<int> numbers;
        for (const P problem : problems)
            numbers.append(int(problem));
        QTest::newRow(value) << QByteArray(value) << numbers;
    };
    row("a b %f", {});
    row("a \"b c\" \"\\\\$d\\\\\\\\\"", {});
    row("a \"b", {P::OpenQuote});
    row("a 'b' 'c'", {P::ReservedCharacter});
    row("a b;c*", {P::ReservedCharacter, P::ReservedCharacter});
    row("a \"$b\" $c", {P::UnescapedCharacter, P::ReservedCharacter});
    row("a\\", {P::OpenEscape});
    row("a\\ b", {});
    row("a\\\\ b", {P::ReservedCharacter});
    row("a %", {P::IncompleteFieldCode});
    row("a %x %y", {P::UnknownFieldCode, P::UnknownFieldCode});
    row("a %d %D %d", {P::DeprecatedFieldCode, P::DeprecatedFieldCode});
    row("a %f %u", {P::SeveralFileCodes});
    row("a %i %c %k %i", {P::DoubledFieldCode});
    row("a \"%f\" x%F", {P::MisplacedFieldCode, P::SeveralFileCodes, P::MisplacedFieldCode});
    row("a --file=%f", {});
    row("a --files=%F", {P::MisplacedFieldCode});
    row("a \"b %c\"", {P::MisplacedFieldCode});
}

void tst_ExecRewriting::findsFaults()
{
    QFETCH(QByteArray, value);
    QVector<int> problems;
    for (const ExecFaults::Fault &fault : ExecFaults::find(value))
        problems.append(int(fault.problem));
    QTEST(problems, "problems");
}

VEL_TEST_GUILESS_MAIN(tst_ExecRewriting)

#include "tst_ExecRewriting.moc"
