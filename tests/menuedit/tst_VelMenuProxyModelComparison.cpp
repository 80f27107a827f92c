// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ProxyTestCase.h"
#include "SortOrderWalk.h"

#include <frame/DesktopEntryRecord.h>

#include <QDateTime>
#include <QDir>
#include <QRandomGenerator>

/// The comparison of two rows, against one that keeps nothing, and what it reads.
class tst_VelMenuProxyModelComparison : public ProxyTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void readsNothingWhileItSorts();
    void asksOnceForAnEmptyName();
    void agreesWithThePlainComparison();
    void agreesWithItForAnyTwoItems_data();
    void agreesWithItForAnyTwoItems();

private:
    bool plainLessThan(const QModelIndex &left, const QModelIndex &right) const;
    bool plainFallback(const QModelIndex &left, const QModelIndex &right) const;
};

void tst_VelMenuProxyModelComparison::readsNothingWhileItSorts()
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

void tst_VelMenuProxyModelComparison::asksOnceForAnEmptyName()
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

bool tst_VelMenuProxyModelComparison::plainFallback(const QModelIndex &left, const QModelIndex &right) const
{
    if (m_model->isDir(left) && !m_model->isDir(right))
        return false;
    if (!m_model->isDir(left) && m_model->isDir(right))
        return true;
    return QString::localeAwareCompare(left.data().toString(), right.data().toString()) >= 0;
}

// The comparison written down step by step, without anything kept.
bool tst_VelMenuProxyModelComparison::plainLessThan(const QModelIndex &left, const QModelIndex &right) const
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
    const SortOrderWalk walk(list, leftName, rightName);
    if (walk.leftPlace() != walk.rightPlace())
        return walk.rightPlace() < walk.leftPlace();
    return plainFallback(left, right);
}

void tst_VelMenuProxyModelComparison::agreesWithThePlainComparison()
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

void tst_VelMenuProxyModelComparison::agreesWithItForAnyTwoItems_data()
{
    QTest::addColumn<QString>("root");
    QTest::newRow("plain") << "menu";
    QTest::newRow("with a slash") << "menu/";
}

// A sort asks only about siblings, but a host may ask about anything in the file system.
void tst_VelMenuProxyModelComparison::agreesWithItForAnyTwoItems()
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

VEL_TEST_MAIN(tst_VelMenuProxyModelComparison)
#include "tst_VelMenuProxyModelComparison.moc"
