// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <desktopentry/ChangedLines.h>

#include <QRandomGenerator>

namespace {

QString textOf(const QStringList &lines)
{
    return lines.isEmpty() ? QString() : lines.join(QLatin1Char('\n')) + QLatin1Char('\n');
}

} // namespace

/// Which lines of a text are marked as changed.
class tst_ChangedLines : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void tellsLinesApart_data();
    void tellsLinesApart();
    void keepsEveryLineThatStayed();
    void copesWithManyLines();
};

void tst_ChangedLines::tellsLinesApart_data()
{
    QTest::addColumn<QString>("before");
    QTest::addColumn<QString>("after");
    QTest::addColumn<QString>("kinds"); // a character for each line
    QTest::addColumn<int>("removed");

    QTest::newRow("the same") << "a\nb\n"
                              << "a\nb\n"
                              << "  " << 0;
    QTest::newRow("nothing") << ""
                             << ""
                             << "" << 0;
    QTest::newRow("a new file") << ""
                                << "a\nb\n"
                                << "++" << 0;
    QTest::newRow("changed") << "a\nb\nc\n"
                             << "a\nx\nc\n"
                             << " ~ " << 0;
    QTest::newRow("inserted") << "a\nc\n"
                              << "a\nb\nc\n"
                              << " + " << 0;
    QTest::newRow("removed") << "a\nb\nc\n"
                             << "a\nc\n"
                             << "  " << 1;
    QTest::newRow("first and last") << "a\nb\nc\nd\n"
                                    << "x\nb\nc\ny\n"
                                    << "~  ~" << 0;
    QTest::newRow("changed and more") << "a\nb\nc\n"
                                      << "a\nx\ny\nc\n"
                                      << " ~+ " << 0;
    QTest::newRow("two for one") << "a\nb\nc\nd\n"
                                 << "a\nx\nd\n"
                                 << " ~ " << 1;
    QTest::newRow("at several places") << "a\nb\nc\nd\ne\n"
                                       << "a\nc\nx\nd\ny\n"
                                       << "  + ~" << 1;
    QTest::newRow("without an end") << "a\nb"
                                    << "a\nb\n"
                                    << "  " << 0;
    QTest::newRow("emptied") << "a\nb\n"
                             << ""
                             << "" << 2;
}

void tst_ChangedLines::tellsLinesApart()
{
    QFETCH(QString, before);
    QFETCH(QString, after);
    QFETCH(QString, kinds);
    QFETCH(int, removed);
    const ChangedLines text(before, after);
    QString told;
    for (const ChangedLines::Kind kind : text.kinds())
        told += QLatin1Char(" ~+"[kind]);
    QCOMPARE(told, kinds);
    QCOMPARE(text.removed(), removed);
    QCOMPARE(text.count(ChangedLines::New), kinds.count(QLatin1Char('+')));
}

// Whatever was done to it, the lines that are called the same are a part of what there was.
void tst_ChangedLines::keepsEveryLineThatStayed()
{
    QRandomGenerator random(1);
    for (int round = 0; round < 2000; ++round) {
        QStringList before;
        for (int i = random.bounded(8); i > 0; --i)
            before.append(QString::number(random.bounded(4)));
        QStringList after = before;
        for (int i = random.bounded(4); i > 0; --i) {
            const int at = random.bounded(after.size() + 1);
            if (random.bounded(2) && at < after.size())
                after.removeAt(at);
            else
                after.insert(at, QString::number(random.bounded(4)));
        }
        const ChangedLines text(textOf(before), textOf(after));
        int position = 0;
        for (int i = 0; i < text.lines().size(); ++i) {
            if (text.kinds().at(i) != ChangedLines::Same)
                continue;
            position = before.indexOf(text.lines().at(i), position) + 1;
            QVERIFY(position > 0);
        }
        const int same = text.count(ChangedLines::Same);
        QCOMPARE(same + text.count(ChangedLines::Changed) + text.removed(), before.size());
    }
}

void tst_ChangedLines::copesWithManyLines()
{
    QStringList before;
    for (int i = 0; i < 20000; ++i)
        before.append(QString::number(i));
    QStringList after = before;
    after.first() = QStringLiteral("x");
    after.last() = QStringLiteral("y");
    const ChangedLines text(before.join(QLatin1Char('\n')), after.join(QLatin1Char('\n')));
    QCOMPARE(text.lines().size(), 20000);
    QVERIFY(text.kinds().constFirst() != ChangedLines::Same
            && text.kinds().constLast() != ChangedLines::Same);
}

VEL_TEST_MAIN(tst_ChangedLines)

#include "tst_ChangedLines.moc"
