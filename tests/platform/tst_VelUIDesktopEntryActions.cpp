// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <veluiaux/VelUIDesktopEntry.h>

/// The additional actions of a record, read from and written to their groups.
class tst_VelUIDesktopEntryActions : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();

    void readsActionsInTheOrderOfTheList();
    void readsAnIdAloneWithoutAGroup();
    void readsEachIdOnce();
    void readsTheLastOfDuplicateGroups();
    void hasNoActionThatTheListDoesNotName();
    void changesOnlyTheLinesThatDiffer();
    void leavesTheGroupsAloneWhenOnlyTheOrderChanges();
    void removesAGroupUpToTheNextHeadersComments_data();
    void removesAGroupUpToTheNextHeadersComments();
    void removesAllGroupsOfAnActionThatIsGone();
    void putsANewGroupBehindTheLastActionGroup();
    void putsTheFirstGroupBehindTheMainGroup();
    void adoptsAGroupThatNobodyNamed();
    void leavesOutAnIdThatNoHeaderCanHold();
    void keepsAnOddIdThatTheFileHas();
    void takesTheLaterOfTwoActionsWithOneId();
    void removesAndMakesAnewInOneSave();
    void keepsTheLanguagesOfAnActionThatIsPutBack();
    void keepsTheLanguagesOfAnInheritedActionThatIsPutBack();
    void keepsTheLanguagesThroughAnotherType();
    void keepsTheLanguagesOfAnActionWithANewId();
    void takesNoLanguagesOfAnotherAction();
    void writesLocalTextsInTheVariantFound();

private:
    QByteArray changed(const QByteArray &before, const QList<VelUIDesktopAction> &actions);
};

namespace {

const QByteArray Header = "[Desktop Entry]\n";

VelUIDesktopAction action(const char *id, const char *name = "", const char *exec = "")
{
    VelUIDesktopAction result(QString::fromUtf8(id));
    result.setName(QString::fromUtf8(name));
    result.setExec(QString::fromUtf8(exec));
    return result;
}

} // namespace

void tst_VelUIDesktopEntryActions::init()
{
    TestCase::init();
    qputenv("LANG", "de_DE.UTF-8");
}

QByteArray tst_VelUIDesktopEntryActions::changed(const QByteArray &before,
                                                 const QList<VelUIDesktopAction> &actions)
{
    const QString file = write(QStringLiteral("x.desktop"), before);
    VelUIDesktopEntry record(file);
    record.setActions(actions);
    if (!record.save())
        QTest::qFail("the record was not saved", __FILE__, __LINE__);
    return read(file);
}

void tst_VelUIDesktopEntryActions::readsActionsInTheOrderOfTheList()
{
    const VelUIDesktopEntry record(
        write(QStringLiteral("x.desktop"),
              Header
                  + "Actions=b;a b;\n[Desktop Action a b]\nName=A\nName[de]=AD\nIcon=i\nIcon[de]=id\nExec=e\n"
                    "OnlyShowIn=X;Y;\nNotShowIn=Z;\n[Desktop Action b]\nName=B\n"));
    const QList<VelUIDesktopAction> actions = record.getActions();
    QCOMPARE(actions.size(), 2);
    QCOMPARE(actions[0], action("b", "B"));
    VelUIDesktopAction second = action("a b", "A", "e");
    second.setLocalName(QStringLiteral("AD"));
    second.setIcon(QStringLiteral("i"));
    second.setLocalIcon(QStringLiteral("id"));
    second.setOnlyShowIn({QStringLiteral("X"), QStringLiteral("Y")});
    second.setNotShowIn({QStringLiteral("Z")});
    QCOMPARE(actions[1], second);
}

void tst_VelUIDesktopEntryActions::readsAnIdAloneWithoutAGroup()
{
    const QByteArray bytes = Header + "Actions=a\n";
    const VelUIDesktopEntry record(write(QStringLiteral("x.desktop"), bytes));
    QCOMPARE(record.getActions(), QList<VelUIDesktopAction>{action("a")});
    QCOMPARE(changed(bytes, record.getActions()), bytes);
}

void tst_VelUIDesktopEntryActions::readsEachIdOnce()
{
    const QByteArray bytes = Header + "Actions=a;b;a;\n";
    const VelUIDesktopEntry record(write(QStringLiteral("x.desktop"), bytes));
    QCOMPARE(record.getActions(), (QList<VelUIDesktopAction>{action("a"), action("b")}));
    QCOMPARE(changed(bytes, record.getActions()), bytes);
}

void tst_VelUIDesktopEntryActions::readsTheLastOfDuplicateGroups()
{
    const VelUIDesktopEntry record(
        write(QStringLiteral("x.desktop"),
              Header
                  + "Actions=a;\n[Desktop Action a]\nName=1\nExec=e\n[Desktop Action "
                    "a]\nName=2\n"));
    QCOMPARE(record.getActions(), QList<VelUIDesktopAction>{action("a", "2")});
}

void tst_VelUIDesktopEntryActions::hasNoActionThatTheListDoesNotName()
{
    const QByteArray bytes = Header + "Actions=;\n[Desktop Action a]\nName=A\n";
    const VelUIDesktopEntry record(write(QStringLiteral("x.desktop"), bytes));
    QVERIFY(record.getActions().isEmpty());
    QCOMPARE(changed(bytes, {}), bytes);
}

void tst_VelUIDesktopEntryActions::changesOnlyTheLinesThatDiffer()
{
    const QByteArray before = Header
        + "Actions=a;b\n\n# about a\n[Desktop Action a]\nName = A\nX-own=1\nName[fr]=F\nExec=e\n# tail\n\n"
          "[Desktop Action b]\nName=B\n";
    QByteArray after = before;
    after.replace("Name = A", "Name = New").replace("Exec=e\n", "");
    QCOMPARE(changed(before, {action("a", "New"), action("b", "B")}), after);
}

void tst_VelUIDesktopEntryActions::leavesTheGroupsAloneWhenOnlyTheOrderChanges()
{
    const QByteArray before =
        Header + "Actions=a;b;\n\n[Desktop Action a]\nName=A\n\n[Desktop Action b]\nName=B\n";
    QByteArray after = before;
    after.replace("a;b;", "b;a;");
    QCOMPARE(changed(before, {action("b", "B"), action("a", "A")}), after);
}

void tst_VelUIDesktopEntryActions::removesAGroupUpToTheNextHeadersComments_data()
{
    QTest::addColumn<QByteArray>("group");
    QTest::addColumn<QByteArray>("left");
    QTest::newRow("at once") << QByteArray("[Desktop Action a]\nName=A\n[Next]\nx=y\n")
                             << QByteArray("[Next]\nx=y\n");
    QTest::newRow("blank line") << QByteArray("[Desktop Action a]\nName=A\n\n[Next]\n")
                                << QByteArray("[Next]\n");
    QTest::newRow("its comment") << QByteArray("[Desktop Action a]\nName=A\n\n# next\n # too\n[Next]\n")
                                 << QByteArray("# next\n # too\n[Next]\n");
    QTest::newRow("a comment that is not")
        << QByteArray("[Desktop Action a]\nName=A\n# mine\n\n[Next]\n") << QByteArray("[Next]\n");
    QTest::newRow("both") << QByteArray("[Desktop Action a]\n# mine\n\n# next\n[Next]\n")
                          << QByteArray("# next\n[Next]\n");
    QTest::newRow("the comment above its own header stays")
        << QByteArray("# above\n[Desktop Action a]\nName=A\n[Next]\n") << QByteArray("# above\n[Next]\n");
    QTest::newRow("the last group") << QByteArray("[Desktop Action a]\nName=A\ngarbage\n# end\n\n")
                                    << QByteArray();
    QTest::newRow("no line end") << QByteArray("[Desktop Action a]\nName=A") << QByteArray();
    QTest::newRow("header alone") << QByteArray("[Desktop Action a]") << QByteArray();
    QTest::newRow("carriage returns")
        << QByteArray("[Desktop Action a]\r\nName=A\r\n\r\n# next\r\n[Next]\r\n")
        << QByteArray("# next\r\n[Next]\r\n");
    QTest::newRow("a broken header ends it")
        << QByteArray("[Desktop Action a]\nName=A\n[Broken\nx=y\n") << QByteArray("[Broken\nx=y\n");
}

void tst_VelUIDesktopEntryActions::removesAGroupUpToTheNextHeadersComments()
{
    QFETCH(QByteArray, group);
    QFETCH(QByteArray, left);
    QCOMPARE(changed(Header + "Actions=a;\nName=N\n\n" + group, {}), Header + "Name=N\n\n" + left);
}

void tst_VelUIDesktopEntryActions::removesAllGroupsOfAnActionThatIsGone()
{
    QCOMPARE(
        changed(Header
                    + "Actions=a;b;\n[Desktop Action a]\nName=1\n[Desktop Action b]\nName=B\n[Desktop Action "
                      "a]\nName=2\n",
                {action("b", "B")}),
        Header + "Actions=b;\n[Desktop Action b]\nName=B\n");
}

void tst_VelUIDesktopEntryActions::putsANewGroupBehindTheLastActionGroup()
{
    const QByteArray before =
        Header + "Actions=a;\n\n[Desktop Action a]\nName=A\n# tail\n\n# about\n[X-Other]\nx=y\n";
    QCOMPARE(changed(before, {action("a", "A"), action("b", "B"), action("c", "C", "e")}),
             Header
                 + "Actions=a;b;c;\n\n[Desktop Action a]\nName=A\n# tail\n\n[Desktop Action b]\nName=B\n\n"
                   "[Desktop Action c]\nName=C\nExec=e\n\n# about\n[X-Other]\nx=y\n");
    QCOMPARE(
        changed(Header + "Actions=a;\r\n[Desktop Action a]\r\nName=A", {action("a", "A"), action("b", "B")}),
        Header + "Actions=a;b;\r\n[Desktop Action a]\r\nName=A\r\n\r\n[Desktop Action b]\r\nName=B\r\n");
}

void tst_VelUIDesktopEntryActions::putsTheFirstGroupBehindTheMainGroup()
{
    QCOMPARE(changed(Header + "Name=N\n\n[X-Other]\nx=y\n", {action("a", "A")}),
             Header + "Name=N\nActions=a;\n\n[Desktop Action a]\nName=A\n\n[X-Other]\nx=y\n");
    QCOMPARE(changed(Header + "Name=N\n", {action("a")}), Header + "Name=N\nActions=a;\n");
}

void tst_VelUIDesktopEntryActions::adoptsAGroupThatNobodyNamed()
{
    const QByteArray group = "\n[Desktop Action a]\nName=A\nX-own=1\n";
    QCOMPARE(changed(Header + "Name=N\n" + group, {action("a", "A", "e")}),
             Header + "Name=N\nActions=a;\n" + group + "Exec=e\n");
}

void tst_VelUIDesktopEntryActions::leavesOutAnIdThatNoHeaderCanHold()
{
    QCOMPARE(changed(Header, {action(""), action("a]"), action("[b"), action("c\nd"), action("ok", "N")}),
             Header + "Actions=ok;\n\n[Desktop Action ok]\nName=N\n");
}

void tst_VelUIDesktopEntryActions::keepsAnOddIdThatTheFileHas()
{
    const QByteArray bytes = Header + "Actions=a];b\n[Desktop Action a]]\nName=A\n";
    const VelUIDesktopEntry record(write(QStringLiteral("x.desktop"), bytes));
    QCOMPARE(record.getActions(), (QList<VelUIDesktopAction>{action("a]"), action("b")}));
    QCOMPARE(changed(bytes, record.getActions()), bytes);
}

void tst_VelUIDesktopEntryActions::takesTheLaterOfTwoActionsWithOneId()
{
    QCOMPARE(changed(Header, {action("a", "1", "e"), action("b", "B"), action("a", "2")}),
             Header + "Actions=a;b;\n\n[Desktop Action a]\nName=2\n\n[Desktop Action b]\nName=B\n");
}

void tst_VelUIDesktopEntryActions::removesAndMakesAnewInOneSave()
{
    const QString file =
        write(QStringLiteral("x.desktop"), Header + "Actions=a;\n\n[Desktop Action a]\nName=A\nX-own=1\n");
    VelUIDesktopEntry record(file);
    record.setActions({});
    QVERIFY(record.getActions().isEmpty());
    record.setActions({action("a", "New")});
    QCOMPARE(record.getActions(), QList<VelUIDesktopAction>{action("a", "New")});
    QVERIFY(record.save());
    QCOMPARE(VelUIDesktopEntry(file).getActions(), QList<VelUIDesktopAction>{action("a", "New")});
    QCOMPARE(read(file).count("[Desktop Action a]"), 1);
}

void tst_VelUIDesktopEntryActions::keepsTheLanguagesOfAnActionThatIsPutBack()
{
    const QByteArray before = Header
        + "Actions=a;b;\n\n# About a\n[Desktop Action a]\nName=A\nName[fr]=AF\nX-own=1\n\n"
          "[Desktop Action b]\nName=B\nName[ja]=BJ\n";
    const QString file = write(QStringLiteral("x.desktop"), before);
    VelUIDesktopEntry record(file);
    const QList<VelUIDesktopAction> both = record.getActions();
    record.setActions({});
    record.setActions({both.at(1)});
    record.setActions(both);
    QCOMPARE(record.getActions(), both);
    QVERIFY(record.save());
    QCOMPARE(read(file), before);

    VelUIDesktopAction renamed = both.at(0);
    renamed.setName(QStringLiteral("New"));
    record.setActions({});
    record.setActions({renamed, both.at(1)});
    QVERIFY(record.save());
    QCOMPARE(read(file), QByteArray(before).replace("Name=A\n", "Name=New\n"));
}

void tst_VelUIDesktopEntryActions::keepsTheLanguagesOfAnInheritedActionThatIsPutBack()
{
    const VelUIDesktopEntry pattern(
        write(QStringLiteral("pattern.desktop"),
              Header + "Actions=a;\n\n[Desktop Action a]\nName=A\nName[fr]=AF\n"));
    const QString file = path(QStringLiteral("x.desktop"));
    VelUIDesktopEntry record{QString()};
    record.setFilePath(file);
    record.inheritFrom(pattern);
    const QList<VelUIDesktopAction> actions = record.getActions();
    record.setActions({});
    record.setActions(actions);
    QVERIFY(record.save());
    QVERIFY2(read(file).contains("Name[fr]=AF\n"), read(file).constData());
}

void tst_VelUIDesktopEntryActions::keepsTheLanguagesThroughAnotherType()
{
    const QByteArray before =
        Header + "Type=Application\nActions=a;\n\n[Desktop Action a]\nName=A\nName[fr]=AF\n";
    const QString file = write(QStringLiteral("x.desktop"), before);
    VelUIDesktopEntry record(file);
    const QList<VelUIDesktopAction> actions = record.getActions();
    record.setType(QStringLiteral("Link"));
    QVERIFY(record.getActions().isEmpty());
    record.setType(QStringLiteral("Application"));
    record.setActions(actions);
    QVERIFY(record.save());
    QCOMPARE(read(file), before);
}

void tst_VelUIDesktopEntryActions::keepsTheLanguagesOfAnActionWithANewId()
{
    const QString file = write(QStringLiteral("x.desktop"),
                               Header
                                   + "Actions=a_b;c;\n\n[Desktop Action a_b]\nName=A\nName[fr]=AF\n"
                                     "Name[de]=AD\nX-own=1\n\n[Desktop Action c]\nName=C\n");
    VelUIDesktopEntry record(file);
    QList<VelUIDesktopAction> actions = record.getActions();
    VelUIDesktopAction repaired = action("a-b", "A");
    repaired.setLocalName(QStringLiteral("AD"));
    actions[0] = repaired;
    record.setActions(actions);
    QCOMPARE(record.getActions(), actions);
    QVERIFY(record.save());
    QCOMPARE(read(file),
             Header
                 + "Actions=a-b;c;\n\n[Desktop Action c]\nName=C\n\n"
                   "[Desktop Action a-b]\nName=A\nName[fr]=AF\nName[de]=AD\nX-own=1\n");
}

void tst_VelUIDesktopEntryActions::takesNoLanguagesOfAnotherAction()
{
    const QByteArray before = Header + "Actions=a;\n\n[Desktop Action a]\nName=A\nName[fr]=AF\n";
    QVERIFY(!changed(before, {action("b", "B")}).contains("[fr]"));
    QCOMPARE(changed(before, {action("a", "A"), action("b", "A")}).count("[fr]"), 1);
    // Nobody's group is the new action's.
    QCOMPARE(changed(before + "\n[Desktop Action b]\nName=B\nName[ja]=BJ\n", {action("b", "A")}),
             Header + "Actions=b;\n\n[Desktop Action b]\nName=A\nName[ja]=BJ\n");
}

void tst_VelUIDesktopEntryActions::writesLocalTextsInTheVariantFound()
{
    VelUIDesktopAction local = action("a", "A");
    local.setLocalName(QStringLiteral("L"));
    local.setLocalIcon(QStringLiteral("i"));
    QCOMPARE(changed(Header + "Actions=a;\n[Desktop Action a]\nName=A\nName[de_DE]=B\nName[de]=C\n", {local}),
             Header + "Actions=a;\n[Desktop Action a]\nName=A\nName[de_DE]=L\nName[de]=C\nIcon[de]=i\n");
}

VEL_TEST_GUILESS_MAIN(tst_VelUIDesktopEntryActions)

#include "tst_VelUIDesktopEntryActions.moc"
