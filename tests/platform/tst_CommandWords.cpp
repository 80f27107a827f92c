// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <CommandWords.h>

class CommandWordsTest : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void refusesWhatIsOpen_data()
    {
        QTest::addColumn<QString>("line");
        for (const char *line : {"a \"b", "a 'b", "a b\\", "\"", "'", "\\", "\"a\\\""})
            QTest::newRow(line) << QString::fromLatin1(line);
    }

    void refusesWhatIsOpen()
    {
        QFETCH(QString, line);
        QVERIFY(!commandWords(line));
    }

    void splitsTheLine_data()
    {
        QTest::addColumn<QString>("line");
        QTest::addColumn<QString>("words"); // with "|" between them
        QTest::newRow("blanks around") << "  a \t b\n"
                                       << "a|b";
        QTest::newRow("double quotes") << "\"a b\" \"c  d\""
                                       << "a b|c  d";
        QTest::newRow("quotes within a word") << "--file=\"a b\".txt"
                                              << "--file=a b.txt";
        QTest::newRow("protected in double quotes") << "\"\\\" \\` \\$ \\\\\""
                                                    << "\" ` $ \\";
        QTest::newRow("not protected in double quotes") << "\"\\n \\a\""
                                                        << "\\n \\a";
        QTest::newRow("single quotes keep all") << "'\\n \"$\" `'"
                                                << "\\n \"$\" `";
        QTest::newRow("backslash outside") << "it\\'s a\\ b"
                                           << "it's|a b";
        QTest::newRow("filled-in argument") << "'it'\\''s'"
                                            << "it's";
        QTest::newRow("nothing is expanded") << "$HOME ~ * ;"
                                             << "$HOME|~|*|;";
        QTest::newRow("empty word") << "a \"\" ''"
                                    << "a||";
        QTest::newRow("one word") << "a"
                                  << "a";
    }

    void splitsTheLine()
    {
        QFETCH(QString, line);
        QFETCH(QString, words);
        QVERIFY(commandWords(line));
        QCOMPARE(commandWords(line)->join(QLatin1Char('|')), words);
    }

    void anEmptyLineHasNoWords()
    {
        QCOMPARE(commandWords(QString())->size(), 0);
        QCOMPARE(commandWords(QStringLiteral("  "))->size(), 0);
    }
};

VEL_TEST_GUILESS_MAIN(CommandWordsTest)
#include "tst_CommandWords.moc"
