// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <CommandLines.h>

#include <string>

class CommandLinesTest : public TestCase
{
    Q_OBJECT

private:
    static QByteArrayList takeAll(CommandLines &lines)
    {
        QByteArrayList result;
        std::string line;
        while (lines.take(&line))
            result.append(QByteArray::fromStdString(line));
        return result;
    }
    static void append(CommandLines &lines, const QByteArray &bytes)
    {
        lines.append(bytes.constData(), static_cast<std::size_t>(bytes.size()));
    }

private Q_SLOTS:
    void cutsLinesWhateverThePiecesAre_data();
    void cutsLinesWhateverThePiecesAre();
    void dropsHalfALine();
    void keepsWholeLinesWhenItDropsHalfALine();
    void forgetsAll();
};

void CommandLinesTest::cutsLinesWhateverThePiecesAre_data()
{
    QTest::addColumn<QByteArray>("bytes");
    QTest::addColumn<QByteArrayList>("expected");
    const QByteArray longest(4096, 'x');
    const QByteArray longer(4097, 'x');
    QTest::newRow("nothing") << QByteArray() << QByteArrayList();
    QTest::newRow("no end") << QByteArray("a") << QByteArrayList();
    QTest::newRow("empty lines") << QByteArray("\n\n") << QByteArrayList({"", ""});
    QTest::newRow("lines") << QByteArray("a\nbc\r\n\nd") << QByteArrayList({"a", "bc\r", ""});
    QTest::newRow("NUL") << QByteArray("a\0b\n", 4) << QByteArrayList{QByteArray("a\0b", 3)};
    QTest::newRow("longest line") << "a\n" + longest + "\nb\n" << QByteArrayList({"a", longest, "b"});
    QTest::newRow("longer line") << "a\n" + longer + "\nb\n" << QByteArrayList({"a", "b"});
    QTest::newRow("two longer lines") << longer + '\n' + longer + "\nb\n" << QByteArrayList({"b"});
    QTest::newRow("longer line without end") << "a\n" + longer << QByteArrayList({"a"});
}

void CommandLinesTest::cutsLinesWhateverThePiecesAre()
{
    QFETCH(QByteArray, bytes);
    QFETCH(QByteArrayList, expected);
    for (const int size : {1, 3, 4095, 4096, 4097, 100000}) {
        CommandLines lines;
        QByteArrayList taken;
        for (int i = 0; i < bytes.size(); i += size) {
            append(lines, bytes.mid(i, size));
            taken += takeAll(lines);
        }
        QCOMPARE(taken, expected);
    }
}

void CommandLinesTest::dropsHalfALine()
{
    CommandLines lines;
    for (const int length : {1, 4096, 4097}) {
        append(lines, "a\n" + QByteArray(length, 'x'));
        QCOMPARE(takeAll(lines), QByteArrayList{"a"});
        lines.dropHalf();
        append(lines, "b\n");
        QCOMPARE(takeAll(lines), QByteArrayList{"b"});
    }
}

void CommandLinesTest::keepsWholeLinesWhenItDropsHalfALine()
{
    CommandLines lines;
    append(lines, "a\nb\nc");
    std::string line;
    QVERIFY(lines.take(&line));
    lines.dropHalf();
    append(lines, "d\n");
    QCOMPARE(takeAll(lines), QByteArrayList({"b", "d"}));
    append(lines, QByteArray(5000, 'x'));
    takeAll(lines);
    append(lines, "x\ne\nf");
    lines.dropHalf(); // the line before is still too long
    QCOMPARE(takeAll(lines), QByteArrayList{"e"});
}

void CommandLinesTest::forgetsAll()
{
    CommandLines lines;
    append(lines, QByteArray(5000, 'x'));
    takeAll(lines);
    append(lines, "a\nb");
    lines.clear();
    append(lines, "c\n");
    QCOMPARE(takeAll(lines), QByteArrayList{"c"});
}

VEL_TEST_GUILESS_MAIN(CommandLinesTest)
#include "tst_CommandLines.moc"
