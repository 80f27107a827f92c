// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "OnlyBelow.h"
#include "ProxyTestCase.h"

#include <QAbstractItemModelTester>
#include <QDateTime>
#include <QDir>
#include <QSaveFile>

/// Rows that come, change and compare equal.
class tst_VelMenuProxyModelRows : public ProxyTestCase
{
    Q_OBJECT

private Q_SLOTS:
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
};

void tst_VelMenuProxyModelRows::sortsManyRowsThatComeAtOnce()
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

void tst_VelMenuProxyModelRows::keepsEqualRowsInTheOrderOfTheFiles_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<QByteArray>("list");
    QTest::addColumn<bool>("reversed");
    QTest::newRow("no list") << QStringLiteral("d") << QByteArray() << true;
    QTest::newRow("a pattern") << QStringLiteral("d") << QByteArray("*;") << true;
    QTest::newRow("by time") << QStringLiteral("recents") << QByteArray() << false;
}

// The file system gives the files in no order.
void tst_VelMenuProxyModelRows::keepsEqualRowsInTheOrderOfTheFiles()
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

void tst_VelMenuProxyModelRows::keepsRowsThatBecomeEqualInTheOrderOfTheFiles()
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

void tst_VelMenuProxyModelRows::sortsTheFilesOnlyWhereItMatters()
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

void tst_VelMenuProxyModelRows::followsTheFilterOfTheFiles()
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

void tst_VelMenuProxyModelRows::followsAnEditedName()
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

void tst_VelMenuProxyModelRows::followsARenamedFile()
{
    for (const char *name : {"a", "b", "c"})
        write(QString::fromUtf8(name), "x");
    order(words("d c b a"));
    show(folder());
    QVERIFY(wait(QString(), 3));

    QVERIFY(QFile::rename(path(QStringLiteral("a")), path(QStringLiteral("d"))));

    QTRY_COMPARE(order(), words("d c b"));
}

void tst_VelMenuProxyModelRows::followsAChangedTime()
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

void tst_VelMenuProxyModelRows::forgetsRowsThatWere()
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

VEL_TEST_MAIN(tst_VelMenuProxyModelRows)
#include "tst_VelMenuProxyModelRows.moc"
