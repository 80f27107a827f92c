// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "Growth.h"
#include "TestCase.h"

#include <menuedit/ItemOrder.h>
#include <menuedit/SortOrder.h>

/// Names and patterns that were made to take long.
class tst_DearNames : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void ordersByTheLanguageHere();
    void ordersDearNamesInLinearTime_data();
    void ordersDearNamesInLinearTime();
    void ordersLongNamesWithoutContradiction();
    void matchesADearPatternInLinearTime_data();
    void matchesADearPatternInLinearTime();
};

namespace {

// Above the length up to which the language decides.
constexpr int ShortName = 1500;
constexpr int ShortPattern = 15;

QString text(const char *utf8, int times = 1)
{
    return QString::fromUtf8(utf8).repeated(times);
}

} // namespace

void tst_DearNames::ordersByTheLanguageHere()
{
    QVERIFY(ItemOrder::compareNames(text("a"), text("B")) < 0);
    QVERIFY(ItemOrder::compareNames(text("ä"), text("b")) < 0);
}

void tst_DearNames::ordersDearNamesInLinearTime_data()
{
    QTest::addColumn<QString>("head");
    QTest::addColumn<QString>("piece");
    QTest::newRow("letters") << QString() << text("ab");
    QTest::newRow("digits") << QString() << text("99");
    QTest::newRow("marks") << QString() << text("\u0301\u0301");
    QTest::newRow("marks in an odd order") << QString() << text("\u0301\u0316");
    QTest::newRow("all marks above before those below")
        << text("\u0301", ShortName * Growth::Factor) << text("\u0316");
    QTest::newRow("vowels before letters") << QString() << text("\u0e40\u0e01");
    QTest::newRow("letters that stand for many") << QString() << text("\ufdfa\ufdfa");
    QTest::newRow("halves of characters") << QString() << QString(2, QChar(0xd800));
}

void tst_DearNames::ordersDearNamesInLinearTime()
{
    QFETCH(QString, head);
    QFETCH(QString, piece);
    // The names differ at both ends: all between them has to be looked at.
    const auto order = [&](int length) {
        const QString middle = head.left(length) + piece.repeated(length / 2);
        const QString left = QLatin1Char('a') + middle + QLatin1Char('a');
        const QString right = QLatin1Char('A') + middle + QLatin1Char('b');
        return [left, right] {
            if (ItemOrder::compareNames(left, right) >= 0)
                QTest::qFail("in the wrong order", __FILE__, __LINE__);
        };
    };
    const double growth = Growth::of(order(ShortName), order(ShortName * Growth::Factor));
    QVERIFY2(growth < Growth::Most, qPrintable(QString::number(growth)));
}

void tst_DearNames::ordersLongNamesWithoutContradiction()
{
    const QString same = text("a", 255);
    const QStringList ascending = {text("a", 254),   same,
                                   same + text("B"), same + text("Ba"),
                                   same + text("a"), text("a", 254) + text("b"),
                                   text("b")};
    for (int i = 0; i < ascending.size(); ++i) {
        for (int k = 0; k < ascending.size(); ++k) {
            const int order = ItemOrder::compareNames(ascending.at(i), ascending.at(k));
            QVERIFY2(i < k       ? order < 0
                         : i > k ? order > 0
                                 : order == 0,
                     qPrintable(QStringLiteral("%1 %2").arg(i).arg(k)));
        }
    }
}

void tst_DearNames::matchesADearPatternInLinearTime_data()
{
    QTest::addColumn<QString>("piece");
    QTest::addColumn<QString>("end");
    QTest::addColumn<bool>("growsName"); // or else the pattern
    const auto row = [](const char *title, const char *piece, const char *end) {
        for (const bool growsName : {false, true}) {
            QTest::addRow("%s, longer %s", title, growsName ? "name" : "pattern")
                << text(piece) << text(end) << growsName;
        }
    };
    row("stars", "*a", "*b");
    row("stars in a row", "*", "b");
    row("stars and question marks", "*?", "*b");
    row("stars and sets", "*[a-z]", "*b");
    row("an open set", "*a", "*[a");
    row("sets", "*[!b]", "*b");
}

void tst_DearNames::matchesADearPatternInLinearTime()
{
    QFETCH(QString, piece);
    QFETCH(QString, end);
    QFETCH(bool, growsName);
    const auto match = [&](int length) {
        const SortOrder::Index index({piece.repeated(growsName ? ShortPattern : length) + end});
        // A file's name has 255 characters at most.
        const QString name = text("a", growsName ? length : ShortPattern * Growth::Factor);
        return [index, name] {
            if (index.mention(name).pattern != SortOrder::AtEnd)
                QTest::qFail("it matches", __FILE__, __LINE__);
        };
    };
    const double growth = Growth::of(match(ShortPattern), match(ShortPattern * Growth::Factor));
    QVERIFY2(growth < Growth::Most, qPrintable(QString::number(growth)));
}

int main(int argc, char **argv)
{
    VelTest::TestEnvironment environment;
    // Only the language of the texts: under the plain one names are ordered by their bytes.
    qputenv("LC_ALL", "de_DE.UTF-8");
    QCoreApplication application(argc, argv);
    tst_DearNames test;
    QTEST_SET_MAIN_SOURCE_PATH
    return QTest::qExec(&test, argc, argv);
}

#include "tst_DearNames.moc"
