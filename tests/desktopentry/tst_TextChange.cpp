// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <desktopentry/TextChange.h>

/// What of typing belongs together when it is taken back.
class tst_TextChange : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void groupsTheChangesOfATextIntoSteps_data();
    void groupsTheChangesOfATextIntoSteps();
    void knowsWhereTheChangeEnds_data();
    void knowsWhereTheChangeEnds();
};

void tst_TextChange::groupsTheChangesOfATextIntoSteps_data()
{
    const auto texts = [](std::initializer_list<const char *> list) {
        QStringList all;
        for (const char *text : list)
            all.append(QString::fromUtf8(text));
        return all;
    };
    QTest::addColumn<QStringList>("texts");
    QTest::addColumn<int>("steps");

    QTest::newRow("a word") << texts({"", "a", "ab", "abc"}) << 1;
    QTest::newRow("two words") << texts({"", "a", "a ", "a b", "a bc"}) << 2;
    QTest::newRow("blanks end a word") << texts({"", "a", "a ", "a  ", "a  b"}) << 2;
    QTest::newRow("equal letters") << texts({"x", "xx", "xxx"}) << 1;
    QTest::newRow("in the middle") << texts({"ad", "abd", "abcd"}) << 1;
    QTest::newRow("at two places") << texts({"abcd", "xabcd", "xabcdy"}) << 2;
    QTest::newRow("Backspace") << texts({"abc", "ab", "a", ""}) << 1;
    QTest::newRow("Delete") << texts({"abc", "bc", "c"}) << 1;
    QTest::newRow("first typed, then deleted") << texts({"", "a", "ab", "a", ""}) << 2;
    QTest::newRow("deleted at two places") << texts({"abcdef", "bcdef", "bcde"}) << 2;
    QTest::newRow("pasted") << texts({"", "a", "apasted", "apastedb"}) << 3;
    QTest::newRow("typed over a selection") << texts({"name", "n", "ne", "new"}) << 2;
    QTest::newRow("beyond the first plane") << texts({"", "\xF0\x9F\x98\x80",
                                                      "\xF0\x9F\x98\x80"
                                                      "a"})
                                            << 1;
}

void tst_TextChange::groupsTheChangesOfATextIntoSteps()
{
    QFETCH(QStringList, texts);
    QFETCH(int, steps);
    int count = 1;
    for (int i = 2; i < texts.size(); ++i) {
        const TextChange former(texts.at(i - 2), texts.at(i - 1));
        const TextChange change(texts.at(i - 1), texts.at(i));
        count += !(former.isTyped() && change.isTyped() && change.continues(former));
    }
    QCOMPARE(count, steps);
}

void tst_TextChange::knowsWhereTheChangeEnds_data()
{
    QTest::addColumn<QString>("before");
    QTest::addColumn<QString>("after");
    QTest::addColumn<int>("end");

    QTest::newRow("appended") << "ab"
                              << "abc" << 3;
    QTest::newRow("removed") << "abc"
                             << "c" << 0;
    QTest::newRow("replaced") << "one two"
                              << "one x two" << 6;
    QTest::newRow("the same") << "ab"
                              << "ab" << 2;
}

void tst_TextChange::knowsWhereTheChangeEnds()
{
    QFETCH(QString, before);
    QFETCH(QString, after);
    QFETCH(int, end);
    QCOMPARE(TextChange(before, after).end(), end);
}

VEL_TEST_MAIN(tst_TextChange)

#include "tst_TextChange.moc"
