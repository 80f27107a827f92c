// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EmblemLayout.h"
#include "TestCase.h"

class tst_EmblemLayout : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void takesASizeInWhichEmblemsAreDrawn_data();
    void takesASizeInWhichEmblemsAreDrawn();
    void standsInTheCornerGiven_data();
    void standsInTheCornerGiven();
    void countsThePixelsOfTheDevice();
    void followsTheShorterEdge();
};

void tst_EmblemLayout::takesASizeInWhichEmblemsAreDrawn_data()
{
    QTest::addColumn<int>("icon");
    QTest::addColumn<int>("emblem");
    QTest::newRow("nothing") << 0 << 0;
    QTest::newRow("8") << 8 << 4;
    QTest::newRow("16") << 16 << 8;
    QTest::newRow("22") << 22 << 8;
    QTest::newRow("32") << 32 << 16;
    QTest::newRow("48") << 48 << 22;
    QTest::newRow("64") << 64 << 32;
    QTest::newRow("96") << 96 << 48;
    QTest::newRow("128") << 128 << 64;
    QTest::newRow("256") << 256 << 128;
    QTest::newRow("1024") << 1024 << 128;
}

void tst_EmblemLayout::takesASizeInWhichEmblemsAreDrawn()
{
    QFETCH(int, icon);
    QTEST(EmblemLayout::extent(icon), "emblem");
}

void tst_EmblemLayout::standsInTheCornerGiven_data()
{
    QTest::addColumn<Qt::Corner>("corner");
    QTest::addColumn<QPoint>("place");
    QTest::newRow("top left") << Qt::TopLeftCorner << QPoint(0, 0);
    QTest::newRow("top right") << Qt::TopRightCorner << QPoint(16, 0);
    QTest::newRow("bottom left") << Qt::BottomLeftCorner << QPoint(0, 16);
    QTest::newRow("bottom right") << Qt::BottomRightCorner << QPoint(16, 16);
}

void tst_EmblemLayout::standsInTheCornerGiven()
{
    QFETCH(Qt::Corner, corner);
    QFETCH(QPoint, place);
    QCOMPARE(EmblemLayout::square(QSize(32, 32), 1, corner), QRect(place, QSize(16, 16)));
}

void tst_EmblemLayout::countsThePixelsOfTheDevice()
{
    QCOMPARE(EmblemLayout::square(QSize(44, 44), 2, Qt::BottomRightCorner), QRect(28, 28, 16, 16));
    QCOMPARE(EmblemLayout::square(QSize(33, 33), 1.5, Qt::TopRightCorner), QRect(21, 0, 12, 12));
}

void tst_EmblemLayout::followsTheShorterEdge()
{
    QCOMPARE(EmblemLayout::square(QSize(64, 16), 1, Qt::BottomRightCorner), QRect(56, 8, 8, 8));
}

VEL_TEST_GUILESS_MAIN(tst_EmblemLayout)

#include "tst_EmblemLayout.moc"
