// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "OnlyBelow.h"
#include "ProxyTestCase.h"

#include <QAbstractItemModelTester>
#include <QDateTime>
#include <QDir>
#include <QTreeView>

/// The order in which a menu is shown.
class tst_VelMenuProxyModel : public ProxyTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void ordersAFolder_data();
    void ordersAFolder();
    void ordersRecentsByTime();
    void leavesOutHiddenEntries();
    void ordersOnlyTheMenu();
    void keepsTheListUntilItIsInvalidated();
    void comparesByFileNameNotByWhatIsShown();
    void putsANewFileInItsPlace();
    void keepsSelectionAndExpansion();
    void livesWithALongList();
    void survivesAFolderThatVanishes();
    void forgetsTheListOfAFolderThatGoes_data();
    void forgetsTheListOfAFolderThatGoes();
};

void tst_VelMenuProxyModel::ordersAFolder_data()
{
    QTest::addColumn<QStringList>("list");
    QTest::addColumn<QStringList>("expected");
    const auto row = [](const char *title, const char *list, const char *expected) {
        QTest::newRow(title) << words(list) << words(expected);
    };
    // Shown as: a "Zeta", b "Beta", c "alpha", x "Xi", y "Ypsilon", folder "Q".
    row("no list", "", "q c.desktop b.desktop x.desktop y.desktop a.desktop");
    row("names", "b.desktop a.desktop", "b.desktop a.desktop q c.desktop x.desktop y.desktop");
    row("names, a pattern between", "x.desktop * y.desktop",
        "x.desktop q c.desktop b.desktop a.desktop y.desktop");
    row("star first", "* q x.desktop", "c.desktop b.desktop y.desktop a.desktop q x.desktop");
    row("pattern for some", "*.desktop", "c.desktop b.desktop x.desktop y.desktop a.desktop q");
    row("two patterns", "[xy]* q* a.desktop", "x.desktop y.desktop q a.desktop c.desktop b.desktop");
    row("names that are not there", "none.desktop y.desktop other",
        "y.desktop q c.desktop b.desktop x.desktop "
        "a.desktop");
    row("a name twice", "a.desktop b.desktop a.desktop",
        "a.desktop b.desktop q c.desktop x.desktop y.desktop");
}

void tst_VelMenuProxyModel::ordersAFolder()
{
    QFETCH(QStringList, list);
    QFETCH(QStringList, expected);
    write(QStringLiteral("a.desktop"), entry("Name=Zeta\n"));
    write(QStringLiteral("b.desktop"), entry("Name=Beta\n"));
    write(QStringLiteral("c.desktop"), entry("Name=alpha\n"));
    write(QStringLiteral("x.desktop"), entry("Name=Xi\n"));
    write(QStringLiteral("y.desktop"), entry("Name=Ypsilon\n"));
    write(QStringLiteral("q/.directory"), "[Desktop Entry]\nType=Directory\nName=Q\n");
    if (!list.isEmpty())
        order(list);
    // Where capitals do not come first, as they do in the locale "C".
    QLocale::setDefault(QLocale(QLocale::English, QLocale::UnitedStates));
    show(folder());

    QVERIFY(wait(QString(), 6));
    QCOMPARE(order(), expected);
}

void tst_VelMenuProxyModel::ordersRecentsByTime()
{
    // The clock of a file system is some milliseconds behind: what is made now may look older than now.
    const QDateTime lately = QDateTime::currentDateTime().addSecs(-60);
    const QStringList files = words("a.desktop c.desktop b.desktop");
    for (int i = 0; i < files.size(); ++i)
        setTime(write(QStringLiteral("recents/") + files.at(i), entry("Name=X\n")), lately.addDays(-i));
    QDir(folder()).mkpath(QStringLiteral("recents/d"));
    order(words("b.desktop d"), QStringLiteral("recents"));
    show(folder());

    QVERIFY(wait(QStringLiteral("recents"), 4));

    QTRY_COMPARE(order(QStringLiteral("recents")), words("d a.desktop c.desktop b.desktop"));
}

void tst_VelMenuProxyModel::leavesOutHiddenEntries()
{
    write(QStringLiteral("a.desktop"), entry("Name=A\n"));
    write(QStringLiteral("b.desktop"), entry("Name=B\nHidden=true\n"));
    write(QStringLiteral("c.desktop"), entry("Name=C\nNoDisplay=true\n"));
    order(words("c.desktop b.desktop a.desktop"));
    show(folder());

    QVERIFY(wait(QString(), 2));
    QCOMPARE(order(), words("c.desktop a.desktop"));

    m_model->setItemName(path(QStringLiteral("b.desktop")), QStringLiteral("B"));
    QCOMPARE(order(), words("c.desktop a.desktop"));
}

void tst_VelMenuProxyModel::ordersOnlyTheMenu()
{
    for (const char *folder : {"menu", "other", "x/autostart"}) {
        write(QString::fromUtf8(folder) + QStringLiteral("/b"), "b");
        write(QString::fromUtf8(folder) + QStringLiteral("/a"), "a");
    }
    QVERIFY(QDir(folder()).mkpath(QStringLiteral("x/zzz")));
    show(path(QStringLiteral("menu")));
    QVERIFY(wait(QStringLiteral("menu"), 2));
    QVERIFY(wait(QStringLiteral("other"), 2));
    QVERIFY(wait(QStringLiteral("x"), 2));

    QCOMPARE(order(QStringLiteral("menu")), words("a b"));
    const QModelIndex a = source(QStringLiteral("other/a"));
    const QModelIndex b = source(QStringLiteral("other/b"));
    QVERIFY(!m_proxy->lessThan(a, b));
    QVERIFY(!m_proxy->lessThan(b, a));
    // "autostart" counts as part of the menu, what stands beside it does not.
    const QModelIndex autostart = source(QStringLiteral("x/autostart"));
    const QModelIndex beside = source(QStringLiteral("x/zzz"));
    QVERIFY(!m_proxy->lessThan(autostart, beside));
    QVERIFY(!m_proxy->lessThan(beside, autostart));
    order(words("zzz autostart"), QStringLiteral("x"));
    m_proxy->invalidateSortOrder(path(QStringLiteral("x")));
    QVERIFY(m_proxy->lessThan(autostart, beside));
    QVERIFY(!m_proxy->lessThan(beside, autostart));
}

void tst_VelMenuProxyModel::keepsTheListUntilItIsInvalidated()
{
    for (const char *name : {"a", "b", "c", "d/e", "d/f"})
        write(QString::fromUtf8(name), "x");
    order(words("b a d c"));
    show(folder());
    QVERIFY(wait(QString(), 4));
    QVERIFY(wait(QStringLiteral("d"), 2));
    QCOMPARE(order(), words("b a d c"));

    order(words("c b a d"));
    order(words("f e"), QStringLiteral("d"));
    m_proxy->invalidate();
    QCOMPARE(order(), words("b a d c"));
    m_proxy->invalidateSortOrder(path(QStringLiteral("d")));
    QCOMPARE(order(), words("b a d c"));
    QCOMPARE(order(QStringLiteral("d")), words("f e"));
    m_proxy->invalidateSortOrder(folder());
    QCOMPARE(order(), words("c b a d"));
}

void tst_VelMenuProxyModel::comparesByFileNameNotByWhatIsShown()
{
    write(QStringLiteral("a.desktop"), entry("Name=b.desktop\n"));
    write(QStringLiteral("b.desktop"), entry("Name=a.desktop\n"));
    order(words("b.desktop a.desktop"));
    show(folder());

    QVERIFY(wait(QString(), 2));

    QCOMPARE(order(), words("b.desktop a.desktop"));
}

void tst_VelMenuProxyModel::putsANewFileInItsPlace()
{
    write(QStringLiteral("a"), "a");
    write(QStringLiteral("c"), "c");
    order(words("c b a"));
    show(folder());
    QVERIFY(wait(QString(), 2));
    OnlyBelow below(m_proxy.get(), folder());
    const QAbstractItemModelTester tester(&below, QAbstractItemModelTester::FailureReportingMode::Fatal);

    write(QStringLiteral("b"), "b");

    QTRY_COMPARE(order(), words("c b a"));
    write(QStringLiteral("new"), "b");
    QTRY_COMPARE(order(), words("c b a new"));
}

void tst_VelMenuProxyModel::keepsSelectionAndExpansion()
{
    for (const char *name : {"a", "b", "c", "d/e", "d/f"})
        write(QString::fromUtf8(name), "x");
    show(folder());
    QVERIFY(wait(QString(), 4));
    QVERIFY(wait(QStringLiteral("d"), 2));
    QTreeView view;
    view.setModel(m_proxy.get());
    view.setRootIndex(m_proxy->mapFromSource(source(QString())));
    view.expand(m_proxy->mapFromSource(source(QStringLiteral("d"))));
    view.setCurrentIndex(m_proxy->mapFromSource(source(QStringLiteral("d/f"))));

    order(words("c d b a"));
    order(words("f e"), QStringLiteral("d"));
    m_proxy->invalidateSortOrder(folder());
    m_proxy->invalidateSortOrder(path(QStringLiteral("d")));

    QCOMPARE(order(), words("c d b a"));
    QCOMPARE(order(QStringLiteral("d")), words("f e"));
    QVERIFY(view.isExpanded(m_proxy->mapFromSource(source(QStringLiteral("d")))));
    QCOMPARE(view.currentIndex(), m_proxy->mapFromSource(source(QStringLiteral("d/f"))));
    QCOMPARE(view.selectionModel()->selectedIndexes(), QModelIndexList{view.currentIndex()});
}

void tst_VelMenuProxyModel::livesWithALongList()
{
    QStringList list;
    for (int i = 0; i < 100000; ++i)
        list.append(QStringLiteral("f%1").arg(i));
    for (int i = 0; i < 300; ++i)
        write(QStringLiteral("f%1").arg(i * 333), "x");
    QStringList expected;
    for (int i = 299; i >= 0; --i)
        expected.append(QStringLiteral("f%1").arg(i * 333));
    std::reverse(list.begin(), list.end());
    order(list);
    show(folder());

    QVERIFY(wait(QString(), 300));

    QCOMPARE(order(), expected);
}

void tst_VelMenuProxyModel::survivesAFolderThatVanishes()
{
    write(QStringLiteral("d/sub/a.desktop"), entry("Name=A\n"));
    write(QStringLiteral("d/b.desktop"), entry("Name=B\n"));
    write(QStringLiteral("e/b.desktop"), entry("Name=B\n"));
    show(folder());
    QVERIFY(wait(QString(), 2));
    QVERIFY(wait(QStringLiteral("d"), 2));
    QVERIFY(wait(QStringLiteral("d/sub"), 1));
    OnlyBelow below(m_proxy.get(), folder());
    const QAbstractItemModelTester tester(&below, QAbstractItemModelTester::FailureReportingMode::Fatal);

    QVERIFY(QDir(path(QStringLiteral("d"))).removeRecursively());
    m_proxy->invalidateSortOrder(path(QStringLiteral("d")));

    QTRY_COMPARE(order(), words("e"));
}

void tst_VelMenuProxyModel::forgetsTheListOfAFolderThatGoes_data()
{
    QTest::addColumn<QString>("listed");
    QTest::newRow("the folder itself") << "d";
    QTest::newRow("a folder in it") << "d/sub";
}

void tst_VelMenuProxyModel::forgetsTheListOfAFolderThatGoes()
{
    QFETCH(QString, listed);
    const auto fill = [this](const QString &folder, const char *list) {
        for (const char *name : {"/a", "/b", "/c"})
            write(folder + QLatin1String(name), "x");
        order(words(list), folder);
    };
    const QString other = QStringLiteral("d2");
    fill(listed, "c b a");
    fill(other, "c b a");
    show(folder());
    QVERIFY(wait(QString(), 2));
    QVERIFY(wait(other, 3));
    if (listed != QLatin1String("d"))
        QVERIFY(wait(QStringLiteral("d"), 1));
    QVERIFY(wait(listed, 3));
    QCOMPARE(order(listed), words("c b a"));

    QVERIFY(QDir(path(QStringLiteral("d"))).removeRecursively());
    QTRY_COMPARE(order(), QStringList{other});
    fill(listed, "b c a");
    order(words("b c a"), other);

    QVERIFY(wait(QString(), 2));
    if (listed != QLatin1String("d"))
        QVERIFY(wait(QStringLiteral("d"), 1));
    QVERIFY(wait(listed, 3));
    QCOMPARE(order(listed), words("b c a"));
    m_proxy->invalidate();
    QCOMPARE(order(other), words("c b a"));
}

VEL_TEST_MAIN(tst_VelMenuProxyModel)
#include "tst_VelMenuProxyModel.moc"
