// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <veluiaux/VelUIDesktopAction.h>

#include <functional>

using Change = std::function<void(VelUIDesktopAction &)>;
Q_DECLARE_METATYPE(Change)

class tst_VelUIDesktopAction : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void isEmptyWhenMadeWithoutAnId();
    void hasAnIdAloneWhenMadeFromAnId();
    void givesBackWhatWasSet();
    void leavesItsCopyAloneWhenChanged();
    void differsFromAnotherInEveryField_data();
    void differsFromAnotherInEveryField();
    void canBeMoved();
};

namespace {

VelUIDesktopAction filled()
{
    VelUIDesktopAction action(QStringLiteral("new"));
    action.setName(QStringLiteral("New"));
    action.setLocalName(QStringLiteral("Neu"));
    action.setIcon(QStringLiteral("document-new"));
    action.setLocalIcon(QStringLiteral("document-neu"));
    action.setExec(QStringLiteral("prog --new"));
    action.setOnlyShowIn({QStringLiteral("VEL")});
    action.setNotShowIn({QStringLiteral("KDE"), QStringLiteral("GNOME")});
    return action;
}

} // namespace

void tst_VelUIDesktopAction::isEmptyWhenMadeWithoutAnId()
{
    const VelUIDesktopAction action;
    QCOMPARE(action.getId(), QString());
    QCOMPARE(action, VelUIDesktopAction(QString()));
}

void tst_VelUIDesktopAction::hasAnIdAloneWhenMadeFromAnId()
{
    const VelUIDesktopAction action(QStringLiteral("new"));
    QCOMPARE(action.getId(), QStringLiteral("new"));
    QCOMPARE(action.getName() + action.getLocalName() + action.getIcon() + action.getLocalIcon()
                 + action.getExec(),
             QString());
    QVERIFY(action.getOnlyShowIn().isEmpty() && action.getNotShowIn().isEmpty());
}

void tst_VelUIDesktopAction::givesBackWhatWasSet()
{
    const VelUIDesktopAction action = filled();
    QCOMPARE(action.getName(), QStringLiteral("New"));
    QCOMPARE(action.getLocalName(), QStringLiteral("Neu"));
    QCOMPARE(action.getIcon(), QStringLiteral("document-new"));
    QCOMPARE(action.getLocalIcon(), QStringLiteral("document-neu"));
    QCOMPARE(action.getExec(), QStringLiteral("prog --new"));
    QCOMPARE(action.getOnlyShowIn(), QStringList{QStringLiteral("VEL")});
    QCOMPARE(action.getNotShowIn(), (QStringList{QStringLiteral("KDE"), QStringLiteral("GNOME")}));
}

void tst_VelUIDesktopAction::leavesItsCopyAloneWhenChanged()
{
    VelUIDesktopAction action = filled();
    const VelUIDesktopAction copy(action);
    action.setName(QStringLiteral("Other"));
    QCOMPARE(copy.getName(), QStringLiteral("New"));
    QVERIFY(copy != action);
}

void tst_VelUIDesktopAction::differsFromAnotherInEveryField_data()
{
    QTest::addColumn<Change>("change");
    const QString other = QStringLiteral("other");
    QTest::newRow("id") << Change([](auto &action) { action = VelUIDesktopAction(QStringLiteral("x")); });
    QTest::newRow("name") << Change([other](auto &action) { action.setName(other); });
    QTest::newRow("local name") << Change([other](auto &action) { action.setLocalName(other); });
    QTest::newRow("icon") << Change([other](auto &action) { action.setIcon(other); });
    QTest::newRow("local icon") << Change([other](auto &action) { action.setLocalIcon(other); });
    QTest::newRow("exec") << Change([other](auto &action) { action.setExec(other); });
    QTest::newRow("only show in") << Change([](auto &action) { action.setOnlyShowIn({}); });
    QTest::newRow("not show in") << Change([](auto &action) { action.setNotShowIn({}); });
}

void tst_VelUIDesktopAction::differsFromAnotherInEveryField()
{
    QFETCH(Change, change);
    VelUIDesktopAction action = filled();
    QCOMPARE(action, filled());
    change(action);
    QVERIFY(action != filled());
}

void tst_VelUIDesktopAction::canBeMoved()
{
    VelUIDesktopAction from = filled();
    VelUIDesktopAction to;
    to = std::move(from);
    QCOMPARE(to, filled());
    const VelUIDesktopAction made(std::move(to));
    QCOMPARE(made, filled());
}

VEL_TEST_GUILESS_MAIN(tst_VelUIDesktopAction)

#include "tst_VelUIDesktopAction.moc"
