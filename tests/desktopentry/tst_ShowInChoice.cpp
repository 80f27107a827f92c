// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FormDriving.h"
#include "TestCase.h"

#include <desktopentry/FormLayout.h>
#include <desktopentry/StringListEdit.h>
#include <desktopentry/fields/ShowInChoice.h>
#include <frame/DesktopEntryRecord.h>

#include <QRadioButton>
#include <QSignalSpy>

using namespace FormDriving;
using namespace VelUI;

namespace {

const QStringList Desktops{QStringLiteral("X")};
const QStringList Others{QStringLiteral("Y"), QStringLiteral("Z")};

VelUIDesktopAction actionWith(const QStringList &only, const QStringList &no)
{
    VelUIDesktopAction action(QStringLiteral("id"));
    action.setOnlyShowIn(only);
    action.setNotShowIn(no);
    return action;
}

// A form that consists of the choice alone.
class Form : public QWidget
{
public:
    Form()
        : choice(
            {QStringLiteral("Only"), QStringLiteral("Not"), QStringLiteral("Add:"), QStringLiteral("Edit:")},
            new FormLayout(this))
    {
    }

    QRadioButton *button(const char *name) const { return child<QRadioButton>(this, name); }
    StringListEdit *list(const char *name) const { return child<StringListEdit>(this, name); }

    ShowInChoice choice;
};

} // namespace

class tst_ShowInChoice : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void startsWithTheFirstButton();
    void appendsTwoRows();
    void enablesTheListOfTheChosenButton();
    void choosesTheButtonByTheLists();
    void writesTheChosenListAlone();
    void tellsOfASwitchOfTheUsers();
};

void tst_ShowInChoice::startsWithTheFirstButton()
{
    const Form form;
    QVERIFY(form.button("onlyShowInButton")->isChecked());
    QVERIFY(form.list("onlyShowInEdit")->isEnabled());
    QVERIFY(!form.list("notShowInEdit")->isEnabled());
}

void tst_ShowInChoice::appendsTwoRows()
{
    const Form form;
    const auto *layout = form.findChild<FormLayout *>();
    const int last = layout->rowCount() - 1;
    QCOMPARE(layout->itemAtPosition(last - 1, 0)->widget(), form.button("onlyShowInButton"));
    QCOMPARE(layout->itemAtPosition(last - 1, 1)->widget(), form.list("onlyShowInEdit"));
    QCOMPARE(layout->itemAtPosition(last, 0)->widget(), form.button("notShowInButton"));
    QCOMPARE(layout->itemAtPosition(last, 1)->widget(), form.list("notShowInEdit"));
    QCOMPARE(form.button("notShowInButton")->text(), QStringLiteral("Not"));
}

void tst_ShowInChoice::enablesTheListOfTheChosenButton()
{
    const Form form;
    form.button("notShowInButton")->click();
    QVERIFY(!form.list("onlyShowInEdit")->isEnabled());
    QVERIFY(form.list("notShowInEdit")->isEnabled());
    QVERIFY(!form.button("onlyShowInButton")->isChecked());
}

void tst_ShowInChoice::choosesTheButtonByTheLists()
{
    Form form;
    form.choice.load(actionWith(Desktops, Others));
    QVERIFY(form.button("notShowInButton")->isChecked());
    form.choice.load(actionWith(Desktops, {}));
    QVERIFY(form.button("onlyShowInButton")->isChecked());
    QCOMPARE(form.list("onlyShowInEdit")->strings(), Desktops);
    QCOMPARE(form.list("notShowInEdit")->strings(), QStringList());
}

void tst_ShowInChoice::writesTheChosenListAlone()
{
    Form form;
    form.choice.load(Desktops, Others);
    VelUIDesktopAction fresh(QStringLiteral("id"));
    form.choice.save(&fresh);
    QCOMPARE(fresh.getOnlyShowIn(), QStringList());
    QCOMPARE(fresh.getNotShowIn(), Others);
    VelUIDesktopAction other = actionWith({}, {QStringLiteral("W")});
    form.button("onlyShowInButton")->click();
    form.choice.save(&other);
    QCOMPARE(other.getOnlyShowIn(), Desktops);
    QCOMPARE(other.getNotShowIn(), QStringList({QStringLiteral("W")}));
}

void tst_ShowInChoice::tellsOfASwitchOfTheUsers()
{
    Form form;
    const QSignalSpy switched(&form.choice, &ShowInChoice::switched);
    form.choice.load(Desktops, Others);
    QCOMPARE(switched.count(), 0);
    QVERIFY(!form.choice.isOnlyChosen());
    form.button("onlyShowInButton")->click();
    QCOMPARE(switched.count(), 1);
    QVERIFY(form.choice.isOnlyChosen());
}

VEL_TEST_MAIN(tst_ShowInChoice)

#include "tst_ShowInChoice.moc"
