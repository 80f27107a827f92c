// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <menuedit/TreeOrder.h>

#include <QRandomGenerator>
#include <QStandardItemModel>

#include <algorithm>
#include <random>

/// Where items stand in a tree.
class tst_TreeOrder : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void ordersFromTheTop_data();
    void ordersFromTheTop();
    void leavesOutWhatLiesInOthers_data();
    void leavesOutWhatLiesInOthers();
    void putsNeighborsTogether_data();
    void putsNeighborsTogether();
    void agreesWithTheObviousWay();
    void isQuickWithManyItems();

private:
    QModelIndexList items(const QString &names) const;
    static QString names(const QModelIndexList &items);
    void add(const QString &name, const QString &folder = QString());

    QStandardItemModel m_model;
    QHash<QString, QStandardItem *> m_items;
};

void tst_TreeOrder::init()
{
    TestCase::init();
    m_model.clear();
    m_items.clear();
    for (const char *name : {"a", "b", "c"})
        add(QLatin1String(name));
    for (const char *name : {"bx", "by", "bz"})
        add(QLatin1String(name), QStringLiteral("b"));
    for (const char *name : {"by1", "by2"})
        add(QLatin1String(name), QStringLiteral("by"));
}

void tst_TreeOrder::add(const QString &name, const QString &folder)
{
    auto *item = new QStandardItem(name);
    if (folder.isEmpty())
        m_model.appendRow(item);
    else
        m_items.value(folder)->appendRow(item);
    m_items.insert(name, item);
}

QModelIndexList tst_TreeOrder::items(const QString &names) const
{
    QModelIndexList result;
    for (const QString &name : names.split(QLatin1Char(' '), Qt::SkipEmptyParts))
        result.append(m_items.value(name)->index());
    return result;
}

QString tst_TreeOrder::names(const QModelIndexList &items)
{
    QStringList result;
    for (const QModelIndex &item : items)
        result.append(item.data().toString());
    return result.join(QLatin1Char(' '));
}

void tst_TreeOrder::ordersFromTheTop_data()
{
    QTest::addColumn<QString>("given");
    QTest::addColumn<QString>("expected");
    QTest::newRow("none") << ""
                          << "";
    QTest::newRow("one") << "by2"
                         << "by2";
    QTest::newRow("siblings") << "c a b"
                              << "a b c";
    QTest::newRow("folder first") << "bx b by1 by"
                                  << "b bx by by1";
    QTest::newRow("levels mixed") << "c by2 a bz by1"
                                  << "a by1 by2 bz c";
}

void tst_TreeOrder::ordersFromTheTop()
{
    QFETCH(QString, given);
    QFETCH(QString, expected);
    QCOMPARE(names(TreeOrder::fromTop(items(given))), expected);
}

void tst_TreeOrder::leavesOutWhatLiesInOthers_data()
{
    QTest::addColumn<QString>("given");
    QTest::addColumn<QString>("expected");
    QTest::newRow("none") << ""
                          << "";
    QTest::newRow("siblings") << "c a"
                              << "a c";
    QTest::newRow("folder and inner") << "bx b"
                                      << "b";
    QTest::newRow("inner of the inner") << "by1 b a"
                                        << "a b";
    QTest::newRow("inner folder") << "by2 by bx"
                                  << "bx by";
    QTest::newRow("inner of another") << "by1 c bz"
                                      << "by1 bz c";
}

void tst_TreeOrder::leavesOutWhatLiesInOthers()
{
    QFETCH(QString, given);
    QFETCH(QString, expected);
    QCOMPARE(names(TreeOrder::outermost(items(given))), expected);
}

// Any items of a tree of four levels.
void tst_TreeOrder::putsNeighborsTogether_data()
{
    QTest::addColumn<QString>("given");
    QTest::addColumn<QString>("expected");
    QTest::newRow("none") << QString() << QString();
    QTest::newRow("one") << QStringLiteral("b") << QStringLiteral("b-b");
    QTest::newRow("neighbors, from below") << QStringLiteral("c b a") << QStringLiteral("a-c");
    QTest::newRow("a gap") << QStringLiteral("a c") << QStringLiteral("a-a c-c");
    QTest::newRow("of two folders") << QStringLiteral("by2 bx by1 a by")
                                    << QStringLiteral("a-a bx-by by1-by2");
}

void tst_TreeOrder::putsNeighborsTogether()
{
    QFETCH(QString, given);
    QFETCH(QString, expected);
    QStringList ranges;
    const QItemSelection selection = TreeOrder::ranges(items(given));
    for (const QItemSelectionRange &range : selection)
        ranges.append(range.topLeft().data().toString() + QLatin1Char('-')
                      + range.bottomRight().data().toString());
    QCOMPARE(ranges.join(QLatin1Char(' ')), expected);
}

void tst_TreeOrder::agreesWithTheObviousWay()
{
    for (int i = 0; i < 60; ++i) {
        const QStringList all = m_items.keys();
        const QString folder = all.at(QRandomGenerator::global()->bounded(all.size()));
        add(QStringLiteral("i%1").arg(i), folder);
    }
    QModelIndexList all;
    for (const QStandardItem *item : qAsConst(m_items))
        all.append(item->index());
    std::mt19937 random(QRandomGenerator::global()->generate());
    for (int i = 0; i < 200; ++i) {
        std::shuffle(all.begin(), all.end(), random);
        const QModelIndexList given = all.mid(0, 1 + i % all.size());
        QSet<QModelIndex> expected;
        for (const QModelIndex &item : given) {
            bool isInner = false;
            for (QModelIndex above = item.parent(); above.isValid(); above = above.parent())
                isInner = isInner || given.contains(above);
            if (!isInner)
                expected.insert(item);
        }
        const QModelIndexList found = TreeOrder::outermost(given);
        QCOMPARE(QSet<QModelIndex>(found.begin(), found.end()), expected);
        QCOMPARE(found.size(), expected.size());
        const QModelIndexList ordered = TreeOrder::fromTop(given);
        QCOMPARE(ordered.size(), given.size());
        QModelIndexList kept;
        std::copy_if(ordered.begin(), ordered.end(), std::back_inserter(kept),
                     [&](const QModelIndex &item) { return expected.contains(item); });
        QCOMPARE(found, kept);
    }
}

// What compares each item with each other takes minutes.
void tst_TreeOrder::isQuickWithManyItems()
{
    QModelIndexList many;
    for (int i = 0; i < 50000; ++i)
        m_items.value(QStringLiteral("by"))->appendRow(new QStandardItem(QString::number(i)));
    const QModelIndex folder = m_items.value(QStringLiteral("by"))->index();
    for (int i = 0; i < 50000; ++i)
        many.append(m_model.index(i, 0, folder));
    QCOMPARE(TreeOrder::outermost(many).size(), 50000);
    many.append(folder);
    QCOMPARE(TreeOrder::outermost(many), QModelIndexList{folder});
}

VEL_TEST_GUILESS_MAIN(tst_TreeOrder)
#include "tst_TreeOrder.moc"
