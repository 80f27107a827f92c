// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <menuedit/NeighborRow.h>

#include <QStandardItemModel>

class tst_NeighborRow : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void isTheNextRowThatStays_data();
    void isTheNextRowThatStays();
    void isWhatIsGivenWhereNoRowStays();
};

void tst_NeighborRow::isTheNextRowThatStays_data()
{
    QTest::addColumn<int>("first");
    QTest::addColumn<int>("last");
    QTest::addColumn<int>("expected");
    QTest::newRow("the first") << 0 << 0 << 1;
    QTest::newRow("in the middle") << 1 << 1 << 2;
    QTest::newRow("the last") << 3 << 3 << 2;
    QTest::newRow("some") << 1 << 2 << 3;
    QTest::newRow("some at the end") << 1 << 3 << 0;
}

void tst_NeighborRow::isTheNextRowThatStays()
{
    QFETCH(int, first);
    QFETCH(int, last);
    QFETCH(int, expected);
    QStandardItemModel model;
    auto *folder = new QStandardItem;
    model.appendRow(folder);
    for (int i = 0; i < 4; ++i)
        folder->appendRow(new QStandardItem);

    const QModelIndex row = NeighborRow::whenGone(model, folder->index(), first, last, folder->index());

    QCOMPARE(row, model.index(expected, 0, folder->index()));
}

void tst_NeighborRow::isWhatIsGivenWhereNoRowStays()
{
    QStandardItemModel model(3, 1);
    const QModelIndex other = model.index(1, 0);

    QCOMPARE(NeighborRow::whenGone(model, QModelIndex(), 0, 2, other), other);
    QCOMPARE(NeighborRow::whenGone(model, QModelIndex(), 0, 2, QModelIndex()), QModelIndex());
}

VEL_TEST_GUILESS_MAIN(tst_NeighborRow)

#include "tst_NeighborRow.moc"
