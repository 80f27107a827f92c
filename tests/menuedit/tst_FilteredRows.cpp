// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"
#include <menuedit/FilteredRows.h>

/// Which rows follow from what a filter finds.
class tst_FilteredRows : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void letsNothingThroughAtFirst();
    void letsTheFoldersThroughThatLeadToAMatch();
    void letsAllThroughThatAMatchingFolderHolds();
    void unites();
};

void tst_FilteredRows::letsNothingThroughAtFirst()
{
    const FilteredRows rows;
    QVERIFY(rows.isEmpty());
    QVERIFY(!rows.contains(QStringLiteral("/menu/a")));
}

void tst_FilteredRows::letsTheFoldersThroughThatLeadToAMatch()
{
    FilteredRows rows;
    rows.add(QStringLiteral("/menu"), QStringLiteral("/menu/a/b/x"), false);
    rows.add(QStringLiteral("/menu"), QStringLiteral("/menu/a/y"), false);
    QCOMPARE(rows.count(), 2);
    for (const char *path : {"/menu/a", "/menu/a/b", "/menu/a/b/x", "/menu/a/y"})
        QVERIFY2(rows.contains(QLatin1String(path)), path);
    for (const char *path : {"/menu", "/menu/a/b/z", "/menu/c", "/menu/ab"})
        QVERIFY2(!rows.contains(QLatin1String(path)), path);
    QVERIFY(rows.isMatch(QStringLiteral("/menu/a/y")));
    QVERIFY(!rows.isMatch(QStringLiteral("/menu/a")));
    QCOMPARE(rows.foldersToOpen(), (QSet<QString>{QStringLiteral("/menu/a"), QStringLiteral("/menu/a/b")}));
}

void tst_FilteredRows::letsAllThroughThatAMatchingFolderHolds()
{
    FilteredRows rows;
    rows.add(QStringLiteral("/menu"), QStringLiteral("/menu/a"), true);
    QVERIFY(rows.contains(QStringLiteral("/menu/a/b/x")));
    QVERIFY(!rows.isMatch(QStringLiteral("/menu/a/b/x")));
    QVERIFY(rows.foldersToOpen().isEmpty());
    QVERIFY(!rows.contains(QStringLiteral("/menu/b")));
}

void tst_FilteredRows::unites()
{
    FilteredRows rows;
    rows.add(QStringLiteral("/menu"), QStringLiteral("/menu/a/x"), false);
    FilteredRows other;
    other.add(QStringLiteral("/menu"), QStringLiteral("/menu/b"), true);
    rows.unite(other);
    QCOMPARE(rows.count(), 2);
    QVERIFY(rows.contains(QStringLiteral("/menu/a")) && rows.contains(QStringLiteral("/menu/b/y")));
    QVERIFY(!(rows == other));
    other.unite(rows);
    QVERIFY(rows == other);
}

VEL_TEST_GUILESS_MAIN(tst_FilteredRows)
#include "tst_FilteredRows.moc"
