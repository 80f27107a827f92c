// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <menuedit/ItemOrder.h>
#include <menuedit/VelMenuModel.h>
#include <menuedit/VelMenuProxyModel.h>

#include <QDateTime>
#include <QRandomGenerator>

#include <fcntl.h>
#include <sys/stat.h>

namespace {

/// An item that says nothing but what it was given.
struct Item
{
    QString file;
    QString shown;
    bool folder = false;
    qint64 time = 0;
    QStringList list;

    const QString &fileName() const { return file; }
    const QString &name() const { return shown; }
    bool isFolder() const { return folder; }
    qint64 modified() const { return time; }
    SortOrder::Places placesAgainst(const Item &other) const
    {
        return SortOrder::places(list, file, other.file);
    }
};

Item item(const char *file, const char *shown, bool folder = false, qint64 time = 0,
          const QStringList &list = QStringList())
{
    return {QString::fromUtf8(file), QString::fromUtf8(shown), folder, time, list};
}

QString filesOf(const QVector<Item> &items)
{
    QStringList names;
    for (const Item &each : items)
        names.append(each.file);
    return names.join(QLatin1Char(' '));
}

} // namespace

class tst_ItemOrder : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();

    void ordersRecentsByTime_data();
    void ordersRecentsByTime();
    void asksTheListFirstThenTheKindThenTheName_data();
    void asksTheListFirstThenTheKindThenTheName();
    void asksOnlyTheTimeByTime();
    void putsEqualNamesBelowEachOther();
    void reversesTheFilesOfEqualNames();
    void keepsTheFilesOfEqualTimes();
    void doesNotDependOnTheOrderBefore();
    void agreesWithTheModels_data();
    void agreesWithTheModels();
};

// Numbers in names count as numbers, except in the locale "C".
void tst_ItemOrder::init()
{
    TestCase::init();
    QLocale::setDefault(QLocale(QLocale::English, QLocale::UnitedStates));
}

void tst_ItemOrder::cleanup()
{
    QLocale::setDefault(QLocale::system());
    TestCase::cleanup();
}

void tst_ItemOrder::ordersRecentsByTime_data()
{
    QTest::addColumn<QString>("folder");
    QTest::addColumn<bool>("byTime");
    QTest::newRow("recents") << QStringLiteral("recents") << true;
    QTest::newRow("other case") << QStringLiteral("Recents") << false;
    QTest::newRow("longer") << QStringLiteral("recents2") << false;
    QTest::newRow("nothing") << QString() << false;
}

void tst_ItemOrder::ordersRecentsByTime()
{
    QFETCH(QString, folder);
    QFETCH(bool, byTime);

    QCOMPARE(ItemOrder::ruleOf(folder) == ItemOrder::Rule::ByTime, byTime);
}

void tst_ItemOrder::asksTheListFirstThenTheKindThenTheName_data()
{
    QTest::addColumn<QStringList>("list");
    QTest::addColumn<bool>("leftIsFolder");
    QTest::addColumn<bool>("rightIsFolder");
    QTest::addColumn<bool>("leftIsAbove");
    const QStringList none;
    const QStringList rightFirst{QStringLiteral("right"), QStringLiteral("left")};
    const QStringList both{QStringLiteral("*")};
    QTest::newRow("by name") << none << false << false << true;
    QTest::newRow("folder above a file") << none << false << true << false;
    QTest::newRow("folders by name") << none << true << true << true;
    QTest::newRow("by the list") << rightFirst << false << false << false;
    QTest::newRow("the list before the kind") << rightFirst << true << false << false;
    QTest::newRow("one place, folder above a file") << both << false << true << false;
    QTest::newRow("one place, by name") << both << false << false << true;
}

void tst_ItemOrder::asksTheListFirstThenTheKindThenTheName()
{
    QFETCH(QStringList, list);
    QFETCH(bool, leftIsFolder);
    QFETCH(bool, rightIsFolder);
    QFETCH(bool, leftIsAbove);
    // The times say the opposite.
    const Item left = item("left", "A", leftIsFolder, leftIsAbove ? 1 : 2, list);
    const Item right = item("right", "B", rightIsFolder, leftIsAbove ? 2 : 1, list);

    QCOMPARE(ItemOrder::compare(ItemOrder::Rule::ByList, left, right) < 0, leftIsAbove);
    QCOMPARE(ItemOrder::compare(ItemOrder::Rule::ByList, right, left) < 0, !leftIsAbove);
}

void tst_ItemOrder::asksOnlyTheTimeByTime()
{
    const QStringList list{QStringLiteral("old"), QStringLiteral("young")};
    const Item old = item("old", "A", true, 1, list);
    const Item young = item("young", "B", false, 2, list);

    QVERIFY(ItemOrder::compare(ItemOrder::Rule::ByTime, young, old) < 0);
    QVERIFY(ItemOrder::compare(ItemOrder::Rule::ByTime, old, young) > 0);
    QCOMPARE(ItemOrder::compare(ItemOrder::Rule::ByTime, old, old), 0);
}

void tst_ItemOrder::putsEqualNamesBelowEachOther()
{
    QVERIFY(ItemOrder::isBelow(ItemOrder::Rule::ByList, 0));
    QVERIFY(ItemOrder::isBelow(ItemOrder::Rule::ByList, 1));
    QVERIFY(!ItemOrder::isBelow(ItemOrder::Rule::ByList, -1));
    QVERIFY(!ItemOrder::isBelow(ItemOrder::Rule::ByTime, 0));
    QVERIFY(ItemOrder::isBelow(ItemOrder::Rule::ByTime, 1));
    QVERIFY(!ItemOrder::isBelow(ItemOrder::Rule::ByTime, -1));
}

void tst_ItemOrder::reversesTheFilesOfEqualNames()
{
    QVector<Item> items{item("f10", "Same"), item("f9", "Same"), item("e", "Aaa"), item("f11", "Same")};

    ItemOrder::sort(ItemOrder::Rule::ByList, items);

    QCOMPARE(filesOf(items), QStringLiteral("e f11 f10 f9"));
}

void tst_ItemOrder::keepsTheFilesOfEqualTimes()
{
    QVector<Item> items{item("f10", "A", false, 5), item("f9", "B", false, 5), item("e", "C", false, 9),
                        item("z", "D", true, 5)};

    ItemOrder::sort(ItemOrder::Rule::ByTime, items);

    QCOMPARE(filesOf(items), QStringLiteral("e z f9 f10"));
}

void tst_ItemOrder::doesNotDependOnTheOrderBefore()
{
    const QStringList list{QStringLiteral("f3"), QStringLiteral("*"), QStringLiteral("f5")};
    QVector<Item> items;
    for (int i = 0; i < 40; ++i)
        items.append(item(qPrintable(QStringLiteral("f%1").arg(i)), i % 3 ? "Same" : "Other", i % 7 == 0,
                          i % 5, list));
    for (const ItemOrder::Rule rule : {ItemOrder::Rule::ByList, ItemOrder::Rule::ByTime}) {
        QVector<Item> expected = items;
        ItemOrder::sort(rule, expected);
        for (int round = 0; round < 20; ++round) {
            std::shuffle(items.begin(), items.end(), *QRandomGenerator::global());
            ItemOrder::sort(rule, items);
            QCOMPARE(filesOf(items), filesOf(expected));
        }
    }
}

void tst_ItemOrder::agreesWithTheModels_data()
{
    QTest::addColumn<QString>("folder");
    QTest::addColumn<QStringList>("list");
    const QString menu = QStringLiteral("menu");
    QTest::newRow("no list") << menu << QStringList();
    QTest::newRow("one pattern") << menu << QStringList{QStringLiteral("*")};
    QTest::newRow("names and a pattern")
        << menu << QStringList{QStringLiteral("f3"), QStringLiteral("*"), QStringLiteral("f1")};
    QTest::newRow("names that stand twice")
        << menu << QStringList{QStringLiteral("f3"), QStringLiteral("f1"), QStringLiteral("f3"),
                               QStringLiteral("*1"), QStringLiteral("f1"), QStringLiteral("*")};
    QTest::newRow("by time") << QStringLiteral("recents") << QStringList();
}

// They sort in steps, and begin with the rows of the files.
void tst_ItemOrder::agreesWithTheModels()
{
    QFETCH(QString, folder);
    QFETCH(QStringList, list);
    const QDateTime day(QDate(2020, 1, 1), QTime());
    QVector<Item> items;
    for (int i = 0; i < 60; ++i) {
        const bool isFolder = i % 10 == 0;
        const QString name =
            QStringLiteral("f%1").arg(i) + QLatin1String(isFolder || i % 4 ? "" : ".desktop");
        const QByteArray shown = "Name=" + QByteArray(i % 3 ? "Same" : "Other") + '\n';
        const QString file = folder + QLatin1Char('/') + name;
        if (isFolder)
            write(file + QLatin1String("/.directory"), "[Desktop Entry]\nType=Directory\n" + shown);
        else
            write(file, "[Desktop Entry]\nType=Application\n" + shown);
        const bool isNamed = isFolder || i % 4 == 0;
        items.append({name, isNamed ? QString::fromUtf8(i % 3 ? "Same" : "Other") : name, isFolder, 0, list});
    }
    for (Item &each : items) {
        const QString file = path(folder + QLatin1Char('/') + each.file);
        const timespec time{day.toSecsSinceEpoch() + each.file.size(), 0};
        const timespec times[]{time, time};
        QVERIFY(utimensat(AT_FDCWD, QFile::encodeName(file).constData(), times, 0) == 0);
        each.time = QFileInfo(file).lastModified().toMSecsSinceEpoch();
    }
    write(folder + QLatin1String("/.directory"),
          "[Desktop Entry]\nType=Directory\nSortOrder=" + list.join(QLatin1Char(';')).toUtf8() + '\n');

    VelMenuModel model(path(folder), nullptr, nullptr);
    VelMenuProxyModel proxy(nullptr);
    proxy.setSourceModel(&model);
    proxy.sort(0, Qt::DescendingOrder);
    const auto root = [&] { return proxy.mapFromSource(model.index(path(folder))); };
    QTRY_COMPARE(proxy.rowCount(root()), items.size());

    ItemOrder::sort(ItemOrder::ruleOf(folder), items);
    const auto shown = [&] {
        QStringList names;
        for (int row = 0; row < proxy.rowCount(root()); ++row)
            names.append(proxy.index(row, 0, root()).data(QFileSystemModel::FileNameRole).toString());
        return names.join(QLatin1Char(' '));
    };
    QTRY_COMPARE(shown(), filesOf(items));
}

VEL_TEST_MAIN(tst_ItemOrder)

#include "tst_ItemOrder.moc"
