// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <menuedit/BlockMove.h>

/// Several children that move by one place.
class tst_BlockMove : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void movesByOne_data();
    void movesByOne();
    void comesBack();

private:
    static QStringList list(const QString &letters) { return letters.split(QString(), Qt::SkipEmptyParts); }
    static QString byOne(const QString &all, const QString &shown, const QString &moved, bool up)
    {
        const QStringList names = list(moved);
        return BlockMove::byOne(list(all), list(shown), QSet<QString>(names.begin(), names.end()), up)
            .join(QString());
    }
};

void tst_BlockMove::movesByOne_data()
{
    QTest::addColumn<QString>("shown");
    QTest::addColumn<QString>("moved");
    QTest::addColumn<QString>("up");
    QTest::addColumn<QString>("down");
    QTest::newRow("none") << "abcdef"
                          << ""
                          << "abcdef"
                          << "abcdef";
    QTest::newRow("one") << "abcdef"
                         << "c"
                         << "acbdef"
                         << "abdcef";
    QTest::newRow("block") << "abcdef"
                           << "cd"
                           << "acdbef"
                           << "abecdf";
    QTest::newRow("at the top") << "abcdef"
                                << "ab"
                                << "abcdef"
                                << "cabdef";
    QTest::newRow("at the bottom") << "abcdef"
                                   << "ef"
                                   << "abcefd"
                                   << "abcdef";
    QTest::newRow("two blocks") << "abcdef"
                                << "be"
                                << "bacedf"
                                << "acbdfe";
    QTest::newRow("one block at the end") << "abcdef"
                                          << "ad"
                                          << "abdcef"
                                          << "bacedf";
    QTest::newRow("all") << "abcdef"
                         << "abcdef"
                         << "abcdef"
                         << "abcdef";
    // What a filter leaves out is passed along with what is shown.
    QTest::newRow("filter") << "adf"
                            << "d"
                            << "dabcef"
                            << "abcefd";
    QTest::newRow("block over what is left out") << "acef"
                                                 << "ce"
                                                 << "ceabdf"
                                                 << "abdfce";
    QTest::newRow("first shown") << "cdf"
                                 << "c"
                                 << "abcdef"
                                 << "abdcef";
}

void tst_BlockMove::movesByOne()
{
    QFETCH(QString, shown);
    QFETCH(QString, moved);
    QFETCH(QString, up);
    QFETCH(QString, down);
    QCOMPARE(byOne(QStringLiteral("abcdef"), shown, moved, true), up);
    QCOMPARE(byOne(QStringLiteral("abcdef"), shown, moved, false), down);
}

// Unless a block was at an end, down is the way back from up.
void tst_BlockMove::comesBack()
{
    const QString all = QStringLiteral("abcdefgh");
    for (int bits = 0; bits < 256; bits += 2) {
        QString moved;
        for (int i = 0; i < all.size(); ++i) {
            if (bits & (1 << i))
                moved.append(all.at(i));
        }
        const QString up = byOne(all, all, moved, true);
        QCOMPARE(byOne(up, up, moved, false), all);
        QCOMPARE(QSet<QChar>(up.begin(), up.end()).size(), all.size());
    }
}

VEL_TEST_GUILESS_MAIN(tst_BlockMove)
#include "tst_BlockMove.moc"
