// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "OnlyBelow.h"
#include "TestCase.h"

#include <frame/DesktopEntryRecord.h>
#include <menuedit/VelMenuModel.h>
#include <menuedit/VelMenuProxyModel.h>

#include <QAbstractItemModelTester>
#include <QDateTime>
#include <QDir>
#include <QRandomGenerator>
#include <QSaveFile>
#include <QTreeView>

#include <memory>

#include <fnmatch.h>

class tst_VelMenuProxyModel : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void cleanup();

    void ordersAFolder_data();
    void ordersAFolder();
    void ordersRecentsByTime();
    void leavesOutHiddenEntries();
    void ordersOnlyTheMenu();
    void keepsTheListUntilItIsInvalidated();
    void comparesByFileNameNotByWhatIsShown();
    void putsANewFileInItsPlace();
    void sortsManyRowsThatComeAtOnce();
    void keepsEqualRowsInTheOrderOfTheFiles_data();
    void keepsEqualRowsInTheOrderOfTheFiles();
    void keepsRowsThatBecomeEqualInTheOrderOfTheFiles();
    void sortsTheFilesOnlyWhereItMatters();
    void followsTheFilterOfTheFiles();
    void followsAnEditedName();
    void followsARenamedFile();
    void followsAChangedTime();
    void forgetsRowsThatWere();
    void readsNothingWhileItSorts();
    void asksOnceForAnEmptyName();
    void agreesWithThePlainComparison();
    void agreesWithItForAnyTwoItems_data();
    void agreesWithItForAnyTwoItems();
    void keepsSelectionAndExpansion();
    void livesWithALongList();
    void survivesAFolderThatVanishes();
    void forgetsTheListOfAFolderThatGoes_data();
    void forgetsTheListOfAFolderThatGoes();

private:
    void show(const QString &rootDir);
    bool wait(const QString &name, int rows);
    QModelIndex source(const QString &name) const { return m_model->index(path(name)); }
    QStringList order(const QString &name = QString()) const;
    void order(const QStringList &list, const QString &name = QString());
    bool plainLessThan(const QModelIndex &left, const QModelIndex &right) const;
    bool plainFallback(const QModelIndex &left, const QModelIndex &right) const;

    std::unique_ptr<VelMenuModel> m_model;
    std::unique_ptr<VelMenuProxyModel> m_proxy;
    QString m_rootDir;
};

namespace {

QByteArray entry(const QByteArray &keys)
{
    return "[Desktop Entry]\nType=Application\nExec=true\n" + keys;
}

QStringList words(const char *text)
{
    return QString::fromUtf8(text).split(QLatin1Char(' '), Qt::SkipEmptyParts);
}

void setTime(const QString &path, const QDateTime &time)
{
    QFile file(path);
    QVERIFY(file.open(QIODevice::ReadWrite));
    QVERIFY(file.setFileTime(time, QFileDevice::FileModificationTime));
}

} // namespace

void tst_VelMenuProxyModel::cleanup()
{
    QLocale::setDefault(QLocale::system());
    m_proxy.reset();
    m_model.reset();
    TestCase::cleanup();
}

// As the view does it.
void tst_VelMenuProxyModel::show(const QString &rootDir)
{
    m_proxy.reset();
    m_rootDir = rootDir;
    m_model = std::make_unique<VelMenuModel>(rootDir, nullptr, nullptr);
    m_model->setReadOnly(false);
    m_proxy = std::make_unique<VelMenuProxyModel>(nullptr);
    m_proxy->setSourceModel(m_model.get());
    m_proxy->sort(0, Qt::DescendingOrder);
}

bool tst_VelMenuProxyModel::wait(const QString &name, int rows)
{
    const QModelIndex index = source(name);
    if (m_model->canFetchMore(index))
        m_model->fetchMore(index);
    return QTest::qWaitFor([&] { return m_proxy->rowCount(m_proxy->mapFromSource(source(name))) == rows; });
}

// The file names of a folder's children as they are shown.
QStringList tst_VelMenuProxyModel::order(const QString &name) const
{
    const QModelIndex parent = m_proxy->mapFromSource(source(name));
    QStringList names;
    for (int row = 0; row < m_proxy->rowCount(parent); ++row)
        names.append(m_proxy->index(row, 0, parent).data(QFileSystemModel::FileNameRole).toString());
    return names;
}

void tst_VelMenuProxyModel::order(const QStringList &list, const QString &name)
{
    VelUIDesktopEntry record(path(name + QStringLiteral("/.directory")));
    record.setType(QStringLiteral("Directory"));
    record.setSortOrder(list);
    QVERIFY(record.save());
}

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
    const QDateTime now = QDateTime::currentDateTime();
    const QStringList files = words("a.desktop c.desktop b.desktop");
    for (int i = 0; i < files.size(); ++i)
        setTime(write(QStringLiteral("recents/") + files.at(i), entry("Name=X\n")), now.addDays(-i));
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

void tst_VelMenuProxyModel::sortsManyRowsThatComeAtOnce()
{
    QStringList expected;
    for (int i = 0; i < 1500; ++i) {
        expected.append(QStringLiteral("f%1.desktop").arg(i));
        write(expected.last(), entry("Name=N" + QByteArray::number(10000 + i) + '\n'));
    }
    show(folder());
    OnlyBelow below(m_proxy.get(), folder());
    const QAbstractItemModelTester tester(&below, QAbstractItemModelTester::FailureReportingMode::Fatal);
    bool isSorted = true;
    // Nobody sees them in another order, not even for a moment.
    connect(m_model.get(), &QAbstractItemModel::rowsInserted, this, [&] {
        isSorted = isSorted && m_proxy->dynamicSortFilter();
        const QStringList names = order();
        for (int i = 1; i < names.size(); ++i)
            isSorted = isSorted && expected.indexOf(names.at(i - 1)) < expected.indexOf(names.at(i));
    });

    QVERIFY(wait(QString(), 1500));

    QVERIFY(isSorted);
    QCOMPARE(order(), expected);
    QVERIFY(m_proxy->dynamicSortFilter());
}

void tst_VelMenuProxyModel::keepsEqualRowsInTheOrderOfTheFiles_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<QByteArray>("list");
    QTest::addColumn<bool>("reversed");
    QTest::newRow("no list") << QStringLiteral("d") << QByteArray() << true;
    QTest::newRow("a pattern") << QStringLiteral("d") << QByteArray("*;") << true;
    QTest::newRow("by time") << QStringLiteral("recents") << QByteArray() << false;
}

// The file system gives the files in no order.
void tst_VelMenuProxyModel::keepsEqualRowsInTheOrderOfTheFiles()
{
    QFETCH(QString, name);
    QFETCH(QByteArray, list);
    QFETCH(bool, reversed);
    write(name + QStringLiteral("/.directory"), "[Desktop Entry]\nType=Directory\nSortOrder=" + list + '\n');
    const QDateTime time = QDateTime::currentDateTime().addDays(-1);
    QStringList expected;
    for (int i = 0; i < 300; ++i) {
        expected.append(QStringLiteral("f%1.desktop").arg(reversed ? 999 - i : 100 + i));
        setTime(write(name + QLatin1Char('/') + expected.last(), entry("Name=Same\n")), time);
    }
    show(folder());
    QVERIFY(wait(QString(), 1));

    QVERIFY(wait(name, expected.size()));

    QTRY_COMPARE(order(name), expected);
    m_proxy->invalidateSortOrder(path(name));
    QCOMPARE(order(name), expected);
}

void tst_VelMenuProxyModel::keepsRowsThatBecomeEqualInTheOrderOfTheFiles()
{
    QStringList expected;
    for (int i = 0; i < 50; ++i) {
        expected.append(QStringLiteral("f%1.desktop").arg(99 - i));
        write(expected.last(), entry("Name=N" + QByteArray::number(i) + '\n'));
    }
    show(folder());
    QVERIFY(wait(QString(), expected.size()));
    QCoreApplication::processEvents();

    for (const QString &name : qAsConst(expected))
        m_model->setItemName(path(name), QStringLiteral("Same"));
    QCoreApplication::processEvents();
    m_proxy->invalidate();

    QTRY_COMPARE(order(), expected);
}

void tst_VelMenuProxyModel::sortsTheFilesOnlyWhereItMatters()
{
    for (int i = 0; i < 300; ++i)
        write(QStringLiteral("f%1.desktop").arg(i), entry("Name=N" + QByteArray::number(i) + '\n'));
    write(QStringLiteral("d/a.desktop"), entry("Name=Same\n"));
    write(QStringLiteral("d/b.desktop"), entry("Name=Same\n"));
    show(folder());
    int sorts = 0;
    connect(m_model.get(), &QAbstractItemModel::rowsInserted, this, [&sorts] { sorts = 0; });
    connect(m_model.get(), &QAbstractItemModel::layoutChanged, this, [&sorts] { ++sorts; });
    QVERIFY(wait(QString(), 301));
    QCoreApplication::processEvents();
    QCoreApplication::processEvents();
    QCOMPARE(sorts, 0);

    QVERIFY(wait(QStringLiteral("d"), 2));

    QTRY_VERIFY(sorts > 0);
    QCOMPARE(order(QStringLiteral("d")), words("b.desktop a.desktop"));
}

void tst_VelMenuProxyModel::followsTheFilterOfTheFiles()
{
    write(QStringLiteral("a"), "a");
    write(QStringLiteral("b"), "b");
    write(QStringLiteral("d/x"), "x");
    show(folder());
    QVERIFY(wait(QString(), 3));
    QCoreApplication::processEvents();

    const QDir::Filters filter = m_model->filter();
    m_model->setFilter(QDir::Files);
    QTRY_COMPARE(order(), words("a b"));
    m_model->setFilter(filter);
    QTRY_COMPARE(order(), words("d a b"));
    m_model->setNameFilterDisables(false);
    m_model->setNameFilters({QStringLiteral("b")});
    QTRY_COMPARE(order(), words("d b"));
    m_model->setNameFilters({});
    QTRY_COMPARE(order(), words("d a b"));
}

void tst_VelMenuProxyModel::followsAnEditedName()
{
    write(QStringLiteral("a.desktop"), entry("Name=A\n"));
    write(QStringLiteral("b.desktop"), entry("Name=B\n"));
    write(QStringLiteral("c.desktop"), entry("Name=C\n"));
    show(folder());
    QVERIFY(wait(QString(), 3));
    QCOMPARE(order(), words("a.desktop b.desktop c.desktop"));

    const QString file = write(QStringLiteral("a.desktop"), entry("Name=Z\n"));
    m_model->forgetItemInfo(file);
    QCOMPARE(order(), words("b.desktop c.desktop a.desktop"));

    m_model->setItemName(file, QStringLiteral("BB"));
    QCOMPARE(order(), words("b.desktop a.desktop c.desktop"));

    write(QStringLiteral("a.desktop"), entry("Name=A\nHidden=true\n"));
    m_model->forgetItemInfo(file);
    QCOMPARE(order(), words("b.desktop c.desktop"));
}

void tst_VelMenuProxyModel::followsARenamedFile()
{
    for (const char *name : {"a", "b", "c"})
        write(QString::fromUtf8(name), "x");
    order(words("d c b a"));
    show(folder());
    QVERIFY(wait(QString(), 3));

    QVERIFY(QFile::rename(path(QStringLiteral("a")), path(QStringLiteral("d"))));

    QTRY_COMPARE(order(), words("d c b"));
}

void tst_VelMenuProxyModel::followsAChangedTime()
{
    const QDateTime now = QDateTime::currentDateTime();
    setTime(write(QStringLiteral("recents/a"), "a"), now.addDays(-2));
    setTime(write(QStringLiteral("recents/b"), "b"), now.addDays(-1));
    show(folder());
    QVERIFY(wait(QStringLiteral("recents"), 2));
    QCOMPARE(order(QStringLiteral("recents")), words("b a"));

    QSaveFile file(path(QStringLiteral("recents/a")));
    QVERIFY(file.open(QIODevice::WriteOnly));
    file.write("aa");
    QVERIFY(file.commit());

    QTRY_COMPARE(order(QStringLiteral("recents")), words("a b"));
}

void tst_VelMenuProxyModel::forgetsRowsThatWere()
{
    order(words("* a b c"));
    show(folder());
    for (int round = 0; round < 20; ++round) {
        for (const char *name : {"a", "b", "c", "d"})
            write(QString::fromUtf8(name), "x");
        QVERIFY(wait(QString(), 4));
        QCOMPARE(order(), words("d a b c"));
        for (const char *name : {"a", "b", "c", "d"})
            QVERIFY(QFile::remove(path(QString::fromUtf8(name))));
        QVERIFY(wait(QString(), 0));
    }
}

void tst_VelMenuProxyModel::readsNothingWhileItSorts()
{
    QStringList expected;
    for (int i = 0; i < 100; ++i) {
        expected.append(QStringLiteral("f%1.desktop").arg(i, 3, 10, QLatin1Char('0')));
        write(QStringLiteral("menu/") + expected.last(),
              entry("Name=N" + QByteArray::number(1000 + i) + '\n'));
    }
    show(path(QStringLiteral("menu")));
    QVERIFY(wait(QStringLiteral("menu"), 100));

    // There is nothing left to read, and nobody was told yet.
    QVERIFY(QDir().rename(path(QStringLiteral("menu")), path(QStringLiteral("away"))));
    m_proxy->sort(-1);
    m_proxy->sort(0, Qt::DescendingOrder);

    const QModelIndex root = m_proxy->mapFromSource(m_model->index(path(QStringLiteral("menu"))));
    QCOMPARE(m_proxy->rowCount(root), 100);
    for (int row = 0; row < 100; ++row)
        QCOMPARE(m_proxy->index(row, 0, root).data(QFileSystemModel::FileNameRole).toString(),
                 expected.at(row));
}

void tst_VelMenuProxyModel::asksOnceForAnEmptyName()
{
    const QString file = write(QStringLiteral("a.desktop"), entry(""));
    write(QStringLiteral("b.desktop"), entry("Name=B\n"));
    write(QStringLiteral("c.desktop"), entry("Name=C\n"));
    show(folder());
    QVERIFY(wait(QString(), 3));
    QCOMPARE(order(), words("a.desktop b.desktop c.desktop"));

    const QModelIndex a = source(QStringLiteral("a.desktop"));
    const QModelIndex b = source(QStringLiteral("b.desktop"));
    QVERIFY(m_proxy->lessThan(b, a));
    write(QStringLiteral("a.desktop"), entry("Name=Z\n"));
    QVERIFY(m_proxy->lessThan(b, a));
    // The next sort sees the name.
    m_proxy->invalidate();
    QCOMPARE(order(), words("b.desktop c.desktop a.desktop"));
}

bool tst_VelMenuProxyModel::plainFallback(const QModelIndex &left, const QModelIndex &right) const
{
    if (m_model->isDir(left) && !m_model->isDir(right))
        return false;
    if (!m_model->isDir(left) && m_model->isDir(right))
        return true;
    return QString::localeAwareCompare(left.data().toString(), right.data().toString()) >= 0;
}

// The comparison written down step by step, without anything kept.
bool tst_VelMenuProxyModel::plainLessThan(const QModelIndex &left, const QModelIndex &right) const
{
    const QString leftPath = m_model->filePath(left);
    if (!leftPath.startsWith(m_rootDir) && !leftPath.endsWith(QLatin1String("/autostart")))
        return false;
    if (left.parent().data(QFileSystemModel::FileNameRole).toString() == QLatin1String("recents"))
        return m_model->lastModified(left) < m_model->lastModified(right);
    const QStringList list =
        VelUIDesktopEntry(m_model->filePath(left.parent()) + QStringLiteral("/.directory")).getSortOrder();
    const QString leftName = left.data(QFileSystemModel::FileNameRole).toString();
    const QString rightName = right.data(QFileSystemModel::FileNameRole).toString();
    const auto matches = [](const QString &e, const QString &name) {
        return fnmatch(e.toLocal8Bit().constData(), name.toLocal8Bit().constData(), 0) == 0;
    };
    int leftExact = -1, rightExact = -1, leftAny = -1, rightAny = -1;
    for (int i = 0; i < list.size(); ++i) {
        const QString &e = list.at(i);
        if (e == leftName) {
            if (rightExact != -1) {
                leftExact = i;
                break;
            }
            if (e == rightName) {
                leftExact = rightExact = rightAny = i;
                break;
            }
            leftExact = leftAny = i;
        } else if (e == rightName) {
            rightExact = rightAny = i;
            if (leftExact != -1)
                break;
        } else if (leftAny == -1 && rightAny == -1 && e.contains(QLatin1Char('*'))) {
            leftAny = matches(e, leftName) ? i : -1;
            rightAny = matches(e, rightName) ? i : -1;
        }
    }
    const int end = 2147483647;
    int l = end, r = end;
    if (leftExact != -1) {
        l = leftExact;
        r = rightExact != -1 ? rightExact : rightAny != -1 ? rightAny : end;
    } else if (rightExact != -1) {
        r = rightExact;
        l = leftAny != -1 ? leftAny : end;
    } else if (leftAny != -1) {
        l = leftAny;
        r = rightAny != -1 ? rightAny : end;
    } else if (rightAny != -1) {
        r = rightAny;
    }
    return l != r ? r < l : plainFallback(left, right);
}

void tst_VelMenuProxyModel::agreesWithThePlainComparison()
{
    const QStringList names = words("a b ab A.desktop b.desktop c.desktop *x [a] z.txt \xc3\xa4.desktop");
    for (const QString &name : names)
        write(name,
              name.endsWith(QLatin1String(".desktop")) ? entry("Name=" + name.toUtf8().toUpper() + '\n')
                                                       : "x");
    QVERIFY(QDir(folder()).mkpath(QStringLiteral("d/x")));
    QVERIFY(QDir(folder()).mkpath(QStringLiteral("e.desktop/x")));
    write(QStringLiteral("f/.directory"), "[Desktop Entry]\nType=Directory\nName=b\n");
    order(QStringList());
    show(folder());
    const int count = names.size() + 3;
    QVERIFY(wait(QString(), count));
    const QStringList elements = names + words("d e.desktop f * *.desktop a* [ab]* *x* none");
    const QModelIndex root = source(QString());

    for (int round = 0; round < 60; ++round) {
        QStringList list;
        for (int i = QRandomGenerator::global()->bounded(10); i > 0; --i)
            list.append(elements.at(QRandomGenerator::global()->bounded(elements.size())));
        order(list);
        m_proxy->invalidateSortOrder(folder());
        for (int l = 0; l < count; ++l) {
            for (int r = 0; r < count; ++r) {
                const QModelIndex left = m_model->index(l, 0, root);
                const QModelIndex right = m_model->index(r, 0, root);
                QVERIFY2(m_proxy->lessThan(left, right) == plainLessThan(left, right),
                         qPrintable(list.join(QLatin1Char(' ')) + QStringLiteral(": ")
                                    + left.data().toString() + QStringLiteral(", ")
                                    + right.data().toString()));
            }
        }
    }
}

void tst_VelMenuProxyModel::agreesWithItForAnyTwoItems_data()
{
    QTest::addColumn<QString>("root");
    QTest::newRow("plain") << "menu";
    QTest::newRow("with a slash") << "menu/";
}

// A sort asks only about siblings, but a host may ask about anything in the file system.
void tst_VelMenuProxyModel::agreesWithItForAnyTwoItems()
{
    QFETCH(QString, root);
    const QDateTime now = QDateTime::currentDateTime();
    const QStringList folders = words("menu menu/sub menu/recents menu2 x/autostart");
    QStringList items = words("menu menu2 x x/autostart menu/sub menu/recents");
    int day = 0;
    for (const QString &name : folders) {
        for (const QString &file : words("/a /b /c.desktop")) {
            setTime(write(name + file, "[Desktop Entry]\nName=C\n"), now.addDays(-(++day * 7 % 16)));
            items.append(name + file);
        }
    }
    order(words("b * a"), QStringLiteral("menu"));
    order(words("a sub b"), QStringLiteral("menu/sub"));
    order(words("c.desktop a"), QStringLiteral("menu2"));
    show(path(root));
    QVERIFY(wait(QString(), 3));
    for (const QString &name : folders)
        QVERIFY(wait(name, name == QLatin1String("menu") ? 5 : 3));

    for (const QString &left : qAsConst(items)) {
        for (const QString &right : qAsConst(items))
            QVERIFY2(m_proxy->lessThan(source(left), source(right))
                         == plainLessThan(source(left), source(right)),
                     qPrintable(left + QStringLiteral(", ") + right));
    }
    QVERIFY(!m_proxy->lessThan(QModelIndex(), source(items.constFirst())));
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
