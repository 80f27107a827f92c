// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ActionSamples.h"
#include "TestCase.h"

#include <desktopentry/ActionIds.h>
#include <frame/DesktopEntryRecord.h>

using namespace VelUI;
using ActionIds::Fault;

class tst_ActionIds : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void findsWhatIsWrong_data();
    void findsWhatIsWrong();
    void knowsWhatTheRecordWouldLose_data();
    void knowsWhatTheRecordWouldLose();
    void repairsTheIdsAndNothingElse();
    void repairsThousandsThatAreAlike();
};

Q_DECLARE_METATYPE(QVector<int>)

void tst_ActionIds::findsWhatIsWrong_data()
{
    QTest::addColumn<QStringList>("ids");
    QTest::addColumn<QVector<int>>("faults"); // -1 where nothing is wrong
    QTest::addColumn<QStringList>("repaired");
    constexpr int none = -1, missing = int(Fault::Missing), equal = int(Fault::Equal),
                  impossible = int(Fault::Impossible), odd = int(Fault::Odd);
    const auto row = [](const char *name, const QStringList &ids, const QVector<int> &faults,
                        const QStringList &repaired) { QTest::newRow(name) << ids << faults << repaired; };
    row("a line feed", {QStringLiteral("a\nb")}, {impossible}, {QStringLiteral("a-b")});
    row("brackets", {QStringLiteral("[a]"), QStringLiteral("]")}, {impossible, impossible},
        {QStringLiteral("a"), QStringLiteral("action")});
    row("none", {QString(), QString()}, {missing, missing},
        {QStringLiteral("action"), QStringLiteral("action-2")});
    row("equal", {QStringLiteral("a"), QStringLiteral("a"), QStringLiteral("a-2"), QStringLiteral("a")},
        {none, equal, none, equal},
        {QStringLiteral("a"), QStringLiteral("a-3"), QStringLiteral("a-2"), QStringLiteral("a-4")});
    row("equal and odd", {QStringLiteral("a_b"), QStringLiteral("a_b")}, {odd, equal},
        {QStringLiteral("a-b"), QStringLiteral("a-b-2")});
    row("the proposal is another's", {QStringLiteral("a b"), QStringLiteral("a-b")}, {odd, none},
        {QStringLiteral("a-b-2"), QStringLiteral("a-b")});
    row("blanks around it", {QStringLiteral(" new ")}, {odd}, {QStringLiteral("new")});
    row("only blanks", {QStringLiteral("  ")}, {odd}, {QStringLiteral("action")});
    row("letters with marks", {QStringLiteral("Größer öffnen")}, {odd}, {QStringLiteral("Gro-er-offnen")});
    row("letters of others", {QStringLiteral("新しい")}, {odd}, {QStringLiteral("action")});
    row("upper case is another id", {QStringLiteral("a"), QStringLiteral("A")}, {none, none},
        {QStringLiteral("a"), QStringLiteral("A")});
    row("right", {QStringLiteral("new-Window-2")}, {none}, {QStringLiteral("new-Window-2")});
    row("no action", {}, {}, {});
}

void tst_ActionIds::findsWhatIsWrong()
{
    QFETCH(QStringList, ids);
    QFETCH(QVector<int>, faults);
    QFETCH(QStringList, repaired);
    QVector<int> found(ids.size(), -1);
    QStringList proposed = ids;
    for (const ActionIds::Problem &problem : ActionIds::problems(ids)) {
        QCOMPARE(problem.id, ids.at(problem.row));
        found[problem.row] = int(problem.fault);
        proposed[problem.row] = problem.proposal;
    }
    QCOMPARE(found, faults);
    QCOMPARE(proposed, repaired);
    QVERIFY(ActionIds::problems(repaired).isEmpty());
}

void tst_ActionIds::knowsWhatTheRecordWouldLose_data()
{
    QTest::addColumn<QStringList>("ids");
    for (const char *ids : {"a]", "[", "a,a", "a_b", "a b", " ", "a;b", "a=b", "\\", ""}) {
        const QString text = QString::fromLatin1(ids);
        QTest::newRow(ids) << text.split(QLatin1Char(','));
    }
    QTest::newRow("line feed") << QStringList(QStringLiteral("a\nb"));
    QTest::newRow("delete") << QStringList(QString(QChar(0x7f)));
    QTest::newRow("beyond ASCII") << QStringList(QStringLiteral("\u00e4"));
}

void tst_ActionIds::knowsWhatTheRecordWouldLose()
{
    QFETCH(QStringList, ids);
    QList<VelUIDesktopAction> actions;
    for (const QString &id : ids) {
        actions.append(VelUIDesktopAction(id));
        actions.last().setName(QString::number(actions.size()));
    }
    const QString file = write(QStringLiteral("x.desktop"), "[Desktop Entry]\nType=Application\n");
    VelUIDesktopEntry record(file);
    record.setActions(actions);
    QVERIFY(record.save());
    bool isLost = false;
    for (const ActionIds::Problem &problem : ActionIds::problems(ids))
        isLost = isLost || ActionIds::isLost(problem.fault);
    QCOMPARE(isLost, VelUIDesktopEntry(file).getActions() != actions);
}

void tst_ActionIds::repairsTheIdsAndNothingElse()
{
    VelUIDesktopAction action(QStringLiteral("a_b"));
    action.setName(QStringLiteral("name"));
    action.setLocalName(QStringLiteral("local name"));
    action.setIcon(QStringLiteral("icon"));
    action.setLocalIcon(QStringLiteral("local icon"));
    action.setExec(QStringLiteral("exec"));
    action.setOnlyShowIn({QStringLiteral("only")});
    action.setNotShowIn({QStringLiteral("not")});
    const QList<VelUIDesktopAction> before = {ActionSamples::action("a"), action};
    const QList<VelUIDesktopAction> after = ActionIds::repaired(before);
    QCOMPARE(ActionIds::of(after), QStringList({QStringLiteral("a"), QStringLiteral("a-b")}));
    QCOMPARE(after.at(0), before.at(0));
    QCOMPARE(after.at(1).getName(), action.getName());
    QCOMPARE(after.at(1).getLocalName(), action.getLocalName());
    QCOMPARE(after.at(1).getIcon(), action.getIcon());
    QCOMPARE(after.at(1).getLocalIcon(), action.getLocalIcon());
    QCOMPARE(after.at(1).getExec(), action.getExec());
    QCOMPARE(after.at(1).getOnlyShowIn(), action.getOnlyShowIn());
    QCOMPARE(after.at(1).getNotShowIn(), action.getNotShowIn());
}

void tst_ActionIds::repairsThousandsThatAreAlike()
{
    QStringList ids;
    for (int i = 0; i < 30000; ++i)
        ids.append(QString(QChar(0x4e00 + i % 20000)).repeated(1 + i / 20000));
    const QVector<ActionIds::Problem> problems = ActionIds::problems(ids); // within the time of a test
    QCOMPARE(problems.size(), ids.size());
    QCOMPARE(problems.constLast().proposal, QStringLiteral("action-30000"));
}

VEL_TEST_GUILESS_MAIN(tst_ActionIds)

#include "tst_ActionIds.moc"
