// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "SortOrderWalk.h"
#include "TestCase.h"

#include <menuedit/SortOrder.h>

#include <QElapsedTimer>
#include <QRandomGenerator>

using SortOrder::AtEnd;

class tst_SortOrder : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void placesTwoNames_data();
    void placesTwoNames();
    void agreesWithTheWalkOverRandomLists();
    void tellsListsThatNeverContradictThemselves_data();
    void tellsListsThatNeverContradictThemselves();
    void ordersAnyThreeNamesByAPlainList();
    void answersForALongListOfPatterns();
    void answersSoonForADearPattern_data();
    void answersSoonForADearPattern();
    void rewritesTheList_data();
    void rewritesTheList();
    void listsSeveralTogether_data();
    void listsSeveralTogether();
    void listsCopiesAfterTheirOriginals();
};

namespace {

QString pick(const QStringList &from)
{
    return from.at(QRandomGenerator::global()->bounded(from.size()));
}

QStringList words(const char *text)
{
    return QString::fromUtf8(text).split(QLatin1Char(' '), Qt::SkipEmptyParts);
}

} // namespace

void tst_SortOrder::placesTwoNames_data()
{
    QTest::addColumn<QStringList>("list");
    QTest::addColumn<QString>("left");
    QTest::addColumn<QString>("right");
    QTest::addColumn<int>("leftPlace");
    QTest::addColumn<int>("rightPlace");
    const auto row = [](const char *title, const char *list, const char *left, const char *right,
                        int leftPlace, int rightPlace) {
        QTest::newRow(title) << words(list) << QString::fromUtf8(left) << QString::fromUtf8(right)
                             << leftPlace << rightPlace;
    };
    row("empty list", "", "a", "b", AtEnd, AtEnd);
    row("both named", "b a", "a", "b", 1, 0);
    row("one named", "a", "a", "b", 0, AtEnd);
    row("neither", "x y", "a", "b", AtEnd, AtEnd);
    row("both by one pattern", "*", "a", "b", 0, 0);
    row("named behind the pattern", "x * y", "y", "b", 2, 1);
    row("named before the pattern", "x * y", "x", "b", 0, AtEnd);
    row("own pattern each", "a* b*", "ax", "bx", 0, AtEnd);
    row("own pattern each, turned", "a* b*", "bx", "ax", AtEnd, 0);
    row("second pattern", "c* a*", "ax", "b", 1, AtEnd);
    row("no pattern after a name", "a * b", "c", "a", AtEnd, 0);
    row("pattern that is a name", "a* ab", "a*", "ab", 0, 1);
    row("name twice", "a b a", "a", "c", 2, AtEnd);
    row("name twice, other between", "a b a", "a", "b", 0, 1);
    row("name twice, other behind", "a a b", "a", "b", 1, 2);
    row("other twice", "a a b", "b", "a", 2, 1);
    row("same name", "a b a", "a", "a", 0, 0);
    row("question mark is no pattern", "? a?", "a", "ab", AtEnd, AtEnd);
    row("question mark in a pattern", "?b*", "ab", "b", 0, AtEnd);
    row("brackets in a pattern", "[ab]*", "b", "c", 0, AtEnd);
    row("a star matches a dot", "*", ".a", "b", 0, 0);
    row("case counts", "A a*", "a", "A", AtEnd, 0);
    row("not ASCII", "\xc3\x84* z", "\xc3\x84pfel", "z", 0, 1);
}

void tst_SortOrder::placesTwoNames()
{
    QFETCH(QStringList, list);
    QFETCH(QString, left);
    QFETCH(QString, right);
    QFETCH(int, leftPlace);
    QFETCH(int, rightPlace);

    const SortOrder::Places places = SortOrder::places(list, left, right);

    QCOMPARE(places.left, leftPlace);
    QCOMPARE(places.right, rightPlace);
}

void tst_SortOrder::agreesWithTheWalkOverRandomLists()
{
    const QStringList names = words("a b ab ba c a* *b b.desktop a.desktop \xc3\xa4 [a] a?");
    const QStringList elements = names + words("* *.desktop a* *b ?* [ab]* *a* b*b x y \\** **");
    constexpr int Lists = 300000;
    for (int n = 0; n < Lists; ++n) {
        QStringList list;
        const int size = QRandomGenerator::global()->bounded(8);
        for (int i = 0; i < size; ++i)
            list.append(pick(elements));
        const QString left = pick(names);
        const QString right = pick(names);

        const SortOrder::Places places = SortOrder::places(list, left, right);
        const SortOrderWalk expected(list, left, right);

        if (places.left != expected.leftPlace() || places.right != expected.rightPlace())
            QFAIL(qPrintable(list.join(QLatin1Char(' ')) + QStringLiteral(" : ") + left + QLatin1Char(' ')
                             + right));
    }
}

void tst_SortOrder::tellsListsThatNeverContradictThemselves_data()
{
    QTest::addColumn<QStringList>("list");
    QTest::addColumn<bool>("plain");
    QTest::newRow("empty") << QStringList() << true;
    QTest::newRow("names") << words("a b c") << true;
    QTest::newRow("names and a pattern") << words("a * b") << true;
    QTest::newRow("a name twice") << words("a b a") << false;
    QTest::newRow("a pattern twice") << words("* a *") << false;
    QTest::newRow("two patterns") << words("a* b*") << false;
}

void tst_SortOrder::tellsListsThatNeverContradictThemselves()
{
    QFETCH(QStringList, list);
    QTEST(SortOrder::Index(list).isPlain(), "plain");
}

void tst_SortOrder::ordersAnyThreeNamesByAPlainList()
{
    const QStringList names = words("a b ab ba a* *b a.desktop");
    const QStringList elements = names + words("* *.desktop [ab]* *a* x");
    const auto isBefore = [](const QStringList &list, const QString &left, const QString &right) {
        const SortOrder::Places places = SortOrder::places(list, left, right);
        return places.left < places.right;
    };
    for (int n = 0; n < 100000; ++n) {
        QStringList list;
        for (int i = QRandomGenerator::global()->bounded(7); i > 0; --i)
            list.append(pick(elements));
        const QString a = pick(names), b = pick(names), c = pick(names);
        if (SortOrder::Index(list).isPlain() && !isBefore(list, b, a) && !isBefore(list, c, b))
            QVERIFY2(!isBefore(list, c, a),
                     qPrintable(list.join(QLatin1Char(' ')) + QStringLiteral(" : ") + a + b + c));
    }
}

void tst_SortOrder::answersForALongListOfPatterns()
{
    QStringList list;
    for (int i = 0; i < 100000; ++i)
        list.append(QStringLiteral("*a*a*a*a*%1*b").arg(i % 1000));
    list.append(QStringLiteral("*"));

    const SortOrder::Places places =
        SortOrder::places(list, QString(200, QLatin1Char('a')), QStringLiteral("aaaa7b"));

    QCOMPARE(places.left, AtEnd);
    QCOMPARE(places.right, 7);
}

void tst_SortOrder::answersSoonForADearPattern_data()
{
    QTest::addColumn<QString>("pattern");
    const QString many = QStringLiteral("*a").repeated(120);
    QTest::newRow("stars") << many + QStringLiteral("*b");
    QTest::newRow("stars in a row") << QStringLiteral("*").repeated(20000) + QLatin1Char('b');
    QTest::newRow("stars and question marks") << QStringLiteral("*?").repeated(100) + QStringLiteral("*b");
    QTest::newRow("stars and sets") << QStringLiteral("*[a-z]").repeated(100) + QStringLiteral("*b");
    QTest::newRow("an open set") << many + QStringLiteral("*[a");
    QTest::newRow("a name as a pattern") << QStringLiteral("(a*)*").repeated(40) + QLatin1Char('$');
}

// What backs up to every star would take longer than anybody lives.
void tst_SortOrder::answersSoonForADearPattern()
{
    QFETCH(QString, pattern);
    const SortOrder::Index index({pattern});
    const QString name = QStringLiteral("a").repeated(250);
    QElapsedTimer timer;
    timer.start();
    for (int i = 0; i < 100; ++i)
        QCOMPARE(index.mention(name).pattern, AtEnd);
    QVERIFY2(timer.elapsed() < 5000, qPrintable(QString::number(timer.elapsed())));
}

void tst_SortOrder::rewritesTheList_data()
{
    QTest::addColumn<QStringList>("children");
    QTest::addColumn<QString>("name");
    QTest::addColumn<int>("place");
    QTest::addColumn<QStringList>("expected");
    const auto row = [](const char *title, const char *children, const char *name, int place,
                        const char *expected) {
        QTest::newRow(title) << words(children) << QString::fromUtf8(name) << place << words(expected);
    };
    row("new at the top", "a b c", "x", 0, "* x a b c");
    row("new in the middle", "a b c", "x", 1, "* a x b c");
    row("new at the end", "a b c", "x", 3, "* a b c x");
    row("moved up", "a b c", "c", 0, "* c a b");
    row("moved down", "a b c", "a", 2, "* b a c");
    row("moved to the end", "a b c", "a", 3, "* b c a");
    row("before itself", "a b c", "b", 1, "* a b c");
    row("behind itself", "a b c", "b", 2, "* a b c");
    row("no place for a new one", "a b", "x", -1, "* a b");
    row("no place for a child", "a b", "a", -1, "* b");
    row("place that is none", "a b", "x", 3, "* a b");
    row("empty folder", "", "x", 0, "* x");
    row("nothing at all", "", "x", -1, "*");
}

void tst_SortOrder::rewritesTheList()
{
    QFETCH(QStringList, children);
    QFETCH(QString, name);
    QFETCH(int, place);
    QFETCH(QStringList, expected);

    QCOMPARE(SortOrder::rewritten(children, name, place), expected);
}

void tst_SortOrder::listsSeveralTogether_data()
{
    QTest::addColumn<QString>("names");
    QTest::addColumn<int>("place");
    QTest::addColumn<QString>("expected");
    QTest::newRow("new ones") << "y x" << 1 << "* a y x b c d";
    QTest::newRow("at the end") << "y x" << 4 << "* a b c d y x";
    QTest::newRow("nowhere") << "y b" << -1 << "* a c d";
    QTest::newRow("children") << "d a" << 2 << "* b d a c";
    QTest::newRow("before one of them") << "b d x" << 1 << "* a b d x c";
    QTest::newRow("none") << "" << 1 << "* a b c d";
}

void tst_SortOrder::listsSeveralTogether()
{
    QFETCH(QString, names);
    QFETCH(int, place);
    QFETCH(QString, expected);
    const QStringList children = QStringLiteral("a b c d").split(QLatin1Char(' '));
    QCOMPARE(SortOrder::rewritten(children, names.split(QLatin1Char(' '), Qt::SkipEmptyParts), place)
                 .join(QLatin1Char(' ')),
             expected);
}

void tst_SortOrder::listsCopiesAfterTheirOriginals()
{
    const QStringList children = QStringLiteral("a b c").split(QLatin1Char(' '));
    const QString c = QStringLiteral("c");
    QCOMPARE(SortOrder::withCopies(children,
                                   {{QStringLiteral("a"), QStringLiteral("a-2")}, {c, QStringLiteral("c-2")}})
                 .join(QLatin1Char(' ')),
             QStringLiteral("* a a-2 b c c-2"));
    QCOMPARE(SortOrder::withCopies({}, {{c, QStringLiteral("c-2")}}), QStringList{QStringLiteral("*")});
}

VEL_TEST_GUILESS_MAIN(tst_SortOrder)

#include "tst_SortOrder.moc"
