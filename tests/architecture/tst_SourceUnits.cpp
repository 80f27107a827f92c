// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "HouseRules.h"
#include "SourceFiles.h"
#include "TestCase.h"

#include <QFileInfo>

using SourceFiles::Graph;

namespace {

const QStringList CodeFolders{QStringLiteral("include"),  QStringLiteral("src"),
                              QStringLiteral("platform"), QStringLiteral("apps"),
                              QStringLiteral("designer"), QStringLiteral("examples")};

QStringList codeFiles()
{
    QStringList files;
    for (const QString &folder : CodeFolders)
        files += SourceFiles::below(folder);
    return files;
}

// Which unit uses which. A door leads out of a subsystem and may come back by another one.
Graph unitsInUse()
{
    Graph graph;
    for (const QString &file : codeFiles()) {
        const QString unit = SourceFiles::unitOf(file);
        graph[unit];
        for (const SourceFiles::Include &include : SourceFiles::includesOf(file)) {
            if (!include.file.isEmpty() && SourceFiles::unitOf(include.file) != unit
                && !HouseRules::inForce().isDoor(file, include.file))
                graph[unit].insert(SourceFiles::unitOf(include.file));
        }
    }
    return graph;
}

QString nameOf(const QString &unit)
{
    return unit.section(QLatin1Char('/'), -1);
}

// A class and its private state, or a widget and its accessible face, are two sides of one thing.
bool isOneThing(const QStringList &circle)
{
    if (circle.size() != 2)
        return false;
    for (int i = 0; i < 2; ++i) {
        const QString name = nameOf(circle.at(i));
        const QString plainName = name.startsWith(QLatin1String("Vel")) ? name.mid(3) : name;
        const QString other = nameOf(circle.at(1 - i));
        if (other == name + QLatin1String("Private") || other == plainName + QLatin1String("Accessible"))
            return true;
    }
    return false;
}

// The units of a room, with the public headers that belong to it.
QStringList unitsOf(const QString &room)
{
    QSet<QString> units;
    for (const QString &file : SourceFiles::below(room))
        units.insert(SourceFiles::unitOf(file).mid(room.size() + 1));
    QStringList sorted(units.begin(), units.end());
    sorted.sort();
    return sorted;
}

// Widgets and message boxes of Qt, of which rules and models know nothing.
bool isWindowHeader(const QString &written)
{
    static const QStringList headers{QStringLiteral("QAbstractItemView"), QStringLiteral("QDialog"),
                                     QStringLiteral("QMessageBox"),       QStringLiteral("QToolTip"),
                                     QStringLiteral("QTreeView"),         QStringLiteral("QWidget")};
    return headers.contains(written);
}

constexpr int ModelStage = 1;

QString line(const QString &file, const SourceFiles::Include &include)
{
    return QStringLiteral("%1:%2 includes %3").arg(file).arg(include.line).arg(include.written);
}

} // namespace

// How the source units of the project lean on each other.
class tst_SourceUnits : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void noTwoLeanOnEachOther();
    void reportsTwoThatLeanOnEachOther();
    void haveAStageEach_data() { rooms(); }
    void haveAStageEach();
    void leanTowardsTheRules_data() { rooms(); }
    void leanTowardsTheRules();
    void belowKnowNothingOfTheFloorAbove();
    void composeTheNameOfARecordFileInOnePlaceOfEachHouse();
    void readsStringLiterals();

private:
    static void rooms();
};

void tst_SourceUnits::rooms()
{
    QTest::addColumn<QString>("room");
    for (const QString &room : HouseRules::inForce().rooms())
        QTest::newRow(qPrintable(room)) << room;
}

void tst_SourceUnits::noTwoLeanOnEachOther()
{
    const Graph graph = unitsInUse();
    QVERIFY(graph.size() > 100);
    QStringList wrong;
    for (const QStringList &circle : SourceFiles::circles(graph)) {
        if (!isOneThing(circle))
            wrong.append(circle.join(QStringLiteral(" - ")));
    }
    QVERIFY2(wrong.isEmpty(), qPrintable(wrong.join(QLatin1Char('\n'))));
}

void tst_SourceUnits::reportsTwoThatLeanOnEachOther()
{
    const QString a = QStringLiteral("src/x/Thing");
    const QString b = QStringLiteral("src/x/ThingPrivate");
    const QString c = QStringLiteral("src/x/Other");
    QCOMPARE(SourceFiles::circles({{a, {b}}, {b, {c}}, {c, {}}}), QVector<QStringList>());
    const QVector<QStringList> two = SourceFiles::circles({{a, {b}}, {b, {a, c}}, {c, {}}});
    QCOMPARE(two, QVector<QStringList>({{a, b}}));
    QVERIFY(isOneThing(two.constFirst()));
    const QVector<QStringList> three = SourceFiles::circles({{a, {b}}, {b, {c}}, {c, {a}}});
    QCOMPARE(three, QVector<QStringList>({{c, a, b}}));
    QVERIFY(!isOneThing(three.constFirst()));
    QVERIFY(!isOneThing({a, c}));
    QVERIFY(isOneThing({QStringLiteral("src/x/BoxAccessible"), QStringLiteral("src/x/VelBox")}));
}

void tst_SourceUnits::haveAStageEach()
{
    QFETCH(QString, room);
    QStringList listed;
    for (const QStringList &stage : HouseRules::inForce().stages(room))
        listed += stage;
    listed.sort();
    QCOMPARE(listed.join(QLatin1Char('\n')), unitsOf(room).join(QLatin1Char('\n')));
}

void tst_SourceUnits::leanTowardsTheRules()
{
    QFETCH(QString, room);
    const HouseRules &rules = HouseRules::inForce();
    QStringList wrong;
    for (const QString &file : SourceFiles::below(room)) {
        const int stage = rules.stage(room, SourceFiles::unitOf(file).mid(room.size() + 1));
        for (const SourceFiles::Include &include : SourceFiles::includesOf(file)) {
            if (stage <= ModelStage && isWindowHeader(include.written))
                wrong.append(line(file, include));
            const QString used = include.file.isEmpty() ? QString() : SourceFiles::unitOf(include.file);
            if (SourceFiles::isBelow(used, room) && rules.stage(room, used.mid(room.size() + 1)) > stage)
                wrong.append(line(file, include));
        }
    }
    QVERIFY2(wrong.isEmpty(), qPrintable(wrong.join(QLatin1Char('\n'))));
}

// What lies in a folder of a room is what the room stands on.
void tst_SourceUnits::belowKnowNothingOfTheFloorAbove()
{
    int seen = 0;
    QStringList wrong;
    for (const QString &file : SourceFiles::below(QStringLiteral("src"))) {
        const QString floor = file.section(QLatin1Char('/'), 0, -2);
        if (floor.count(QLatin1Char('/')) < 2)
            continue;
        ++seen;
        for (const SourceFiles::Include &include : SourceFiles::includesOf(file)) {
            const QString used = include.file.isEmpty() ? QString() : SourceFiles::unitOf(include.file);
            const QString room = file.section(QLatin1Char('/'), 0, 1);
            if (SourceFiles::isBelow(used, room) && !SourceFiles::isBelow(used, floor))
                wrong.append(line(file, include));
        }
    }
    QVERIFY(seen > 0);
    QVERIFY2(wrong.isEmpty(), qPrintable(wrong.join(QLatin1Char('\n'))));
}

// The platform is a house of its own, which the library's rules do not reach.
void tst_SourceUnits::composeTheNameOfARecordFileInOnePlaceOfEachHouse()
{
    QStringList library;
    QStringList platform;
    for (const QString &file : codeFiles()) {
        const QStringList literals = SourceFiles::stringLiterals(SourceFiles::textOf(file));
        if (literals.filter(QStringLiteral(".directory")).isEmpty())
            continue;
        (SourceFiles::isBelow(file, QStringLiteral("platform")) ? platform : library).append(file);
    }
    QCOMPARE(library, QStringList(QStringLiteral("src/frame/EntryPath.cpp")));
    QVERIFY2(platform.size() == 1, qPrintable(platform.join(QLatin1Char('\n'))));
}

void tst_SourceUnits::readsStringLiterals()
{
    const QString text = QStringLiteral("call(\"one\", '\"', \"t\\\"wo\"); // \"three\"\n"
                                        "/* \"four\"\n \"five\" */ \"six\" \"\"\n");
    QCOMPARE(
        SourceFiles::stringLiterals(text),
        (QStringList{QStringLiteral("one"), QStringLiteral("t\\\"wo"), QStringLiteral("six"), QString()}));
}

VEL_TEST_GUILESS_MAIN(tst_SourceUnits)

#include "tst_SourceUnits.moc"
