// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FormDriving.h"
#include "PropsFormTestCase.h"

#include <VelDesktopEntryPropsWidget.h>
#include <desktopentry/StringListEdit.h>
#include <frame/DesktopEntryRecord.h>

#include <QRadioButton>

using namespace FormDriving;
using namespace VelUI;

/// The choice between the two lists of desktop environments.
class tst_VelDesktopEntryPropsWidgetShowIn : public PropsFormTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void enablesTheListOfTheChosenButton();
    void choosesTheButtonByTheLists();
    void keepsBothListsWithoutASwitch();
    void writesTheChosenListAlone();
};

void tst_VelDesktopEntryPropsWidgetShowIn::enablesTheListOfTheChosenButton()
{
    VelDesktopEntryPropsWidget form;
    auto *only = child<StringListEdit>(&form, "onlyShowInEdit");
    auto *no = child<StringListEdit>(&form, "notShowInEdit");
    child<QRadioButton>(&form, "notShowInButton")->click();
    QVERIFY(!only->isEnabled() && no->isEnabled());
    QVERIFY(!child<QRadioButton>(&form, "onlyShowInButton")->isChecked());
    child<QRadioButton>(&form, "onlyShowInButton")->click();
    QVERIFY(only->isEnabled() && !no->isEnabled());
}

void tst_VelDesktopEntryPropsWidgetShowIn::choosesTheButtonByTheLists()
{
    VelDesktopEntryPropsWidget form;
    form.loadFrom(entry("[Desktop Entry]\nType=Directory\nName=a\nNotShowIn=X;\n"));
    QVERIFY(child<QRadioButton>(&form, "notShowInButton")->isChecked());
    QVERIFY(child<StringListEdit>(&form, "notShowInEdit")->isEnabled());
    form.loadFrom(entry("[Desktop Entry]\nType=Directory\nName=a\n"));
    QVERIFY(child<QRadioButton>(&form, "onlyShowInButton")->isChecked());
    QVERIFY(!child<StringListEdit>(&form, "notShowInEdit")->isEnabled());
}

void tst_VelDesktopEntryPropsWidgetShowIn::keepsBothListsWithoutASwitch()
{
    const QByteArray bytes = "[Desktop Entry]\nType=Directory\nName=a\nOnlyShowIn=X;\nNotShowIn=Y;\n";
    VelUIDesktopEntry record = entry(bytes);
    VelDesktopEntryPropsWidget form;
    form.loadFrom(record);
    child<QLineEdit>(&form, "nameEdit")->setText(QStringLiteral("b"));
    form.saveTo(&record);
    QVERIFY(record.save());
    QCOMPARE(read(path(QStringLiteral("entry.desktop"))), QByteArray(bytes).replace("Name=a", "Name=b"));
}

void tst_VelDesktopEntryPropsWidgetShowIn::writesTheChosenListAlone()
{
    VelUIDesktopEntry record =
        entry("[Desktop Entry]\nType=Directory\nName=a\nOnlyShowIn=X;\nNotShowIn=Y;\n");
    VelDesktopEntryPropsWidget form;
    form.loadFrom(record);
    child<QRadioButton>(&form, "onlyShowInButton")->click();
    child<StringListEdit>(&form, "onlyShowInEdit")->setStrings({QStringLiteral("Z")});
    form.saveTo(&record);
    QCOMPARE(record.getOnlyShowIn(), QStringList({QStringLiteral("Z")}));
    QCOMPARE(record.getNotShowIn(), QStringList({QStringLiteral("Y")}));
}

VEL_TEST_MAIN(tst_VelDesktopEntryPropsWidgetShowIn)

#include "tst_VelDesktopEntryPropsWidgetShowIn.moc"
