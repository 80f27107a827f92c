// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <menuedit/NameOrder.h>

#include <algorithm>

Q_DECLARE_METATYPE(NameOrder::Child)

/// The order of a folder by name.
class tst_NameOrder : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void sortsByTheNameShown_data();
    void sortsByTheNameShown();
    void followsTheLanguage();
    void knowsTheOrderThatIsShown();
};

void tst_NameOrder::sortsByTheNameShown_data()
{
    QTest::addColumn<QVector<NameOrder::Child>>("children");
    QTest::addColumn<QString>("expected");
    const auto row = [](const char *name, const QVector<NameOrder::Child> &children, const char *expected) {
        QTest::newRow(name) << children << QString::fromLatin1(expected);
    };
    const auto file = [](const char *fileName, const char *name) {
        return NameOrder::Child{QString::fromLatin1(fileName), QString::fromLatin1(name), false};
    };
    const auto folder = [](const char *fileName, const char *name) {
        return NameOrder::Child{QString::fromLatin1(fileName), QString::fromLatin1(name), true};
    };
    row("nothing", {}, "");
    row("no file names", {file("1", "c"), file("2", "a"), file("3", "b")}, "2 3 1");
    row("folders first", {file("a", "a"), folder("z", "z"), folder("y", "y")}, "y z a");
    // As a menu without an order shows them.
    row("equal names", {file("1", "x"), file("2", "x"), file("3", "x")}, "3 2 1");
    row("no name", {file("1", "b"), file("2", "")}, "2 1");
}

void tst_NameOrder::sortsByTheNameShown()
{
    QFETCH(QVector<NameOrder::Child>, children);
    QFETCH(QString, expected);
    QCOMPARE(NameOrder::sorted(children).join(QLatin1Char(' ')), expected);
    std::reverse(children.begin(), children.end());
    QCOMPARE(NameOrder::sorted(children).join(QLatin1Char(' ')), expected);
}

void tst_NameOrder::followsTheLanguage()
{
    const QVector<NameOrder::Child> children{{QStringLiteral("1"), QStringLiteral("b"), false},
                                             {QStringLiteral("2"), QStringLiteral("Z"), false},
                                             {QStringLiteral("3"), QString::fromUtf8("\xc3\xa4"), false}};
    const QStringList order = NameOrder::sorted(children);
    QStringList names;
    for (const QString &fileName : order)
        names.append(children.at(fileName.toInt() - 1).name);
    std::sort(names.begin(), names.end(), [](const QString &left, const QString &right) {
        return QString::localeAwareCompare(left, right) < 0;
    });
    for (int i = 0; i < names.size(); ++i)
        QCOMPARE(children.at(order.at(i).toInt() - 1).name, names.at(i));
}

void tst_NameOrder::knowsTheOrderThatIsShown()
{
    const QVector<NameOrder::Child> children{{QStringLiteral("a"), QStringLiteral("a"), false},
                                             {QStringLiteral("b"), QStringLiteral("b"), false},
                                             {QStringLiteral("c"), QStringLiteral("c"), true}};
    const auto shown = [&](const char *order) {
        const QStringList list = QString::fromLatin1(order).split(QLatin1Char(' '), Qt::SkipEmptyParts);
        return NameOrder::shown(children, SortOrder::Index(list)).join(QLatin1Char(' '));
    };
    QCOMPARE(shown(""), QStringLiteral("c a b"));
    QCOMPARE(shown("b a c"), QStringLiteral("b a c"));
    QCOMPARE(shown("* a"), QStringLiteral("c b a"));
    QCOMPARE(shown("b"), QStringLiteral("b c a"));
}

VEL_TEST_MAIN(tst_NameOrder)
#include "tst_NameOrder.moc"
