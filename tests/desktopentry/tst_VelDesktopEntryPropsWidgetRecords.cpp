// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ActionSamples.h"
#include "EntrySamples.h"
#include "FormDriving.h"
#include "PropsFormTestCase.h"

#include <VelDesktopEntryPropsWidget.h>
#include <desktopentry/ActionListEdit.h>
#include <desktopentry/PathEdit.h>
#include <desktopentry/StringListEdit.h>
#include <frame/DesktopEntryRecord.h>

#include <QCheckBox>
#include <QComboBox>

using namespace FormDriving;
using namespace VelUI;

/// What goes from a record into the form and back.
class tst_VelDesktopEntryPropsWidgetRecords : public PropsFormTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void loadsEveryKey();
    void showsTheBeginningOfLongValues();
    void savesEveryKey();
    void writesNothingForNull();
    void changesNothingInARecordThatItLoaded();
    void takesOnlyTheTypeOfAnInvalidRecord();
    void keepsOddValues_data();
    void keepsOddValues();
    void keepsAPastedLineFeed();
    void keepsOddActions();
};

void tst_VelDesktopEntryPropsWidgetRecords::loadsEveryKey()
{
    VelDesktopEntryPropsWidget form;
    form.loadFrom(entry(EntrySamples::fullApplication()));
    const auto line = [&form](const char *name) {
        auto *widget = child<QWidget>(&form, name);
        auto *self = qobject_cast<QLineEdit *>(widget);
        return (self ? self : widget->findChild<QLineEdit *>())->text();
    };
    QCOMPARE(typeBox(form)->currentData().toString(), application);
    QCOMPARE(line("nameEdit"), QStringLiteral("Full"));
    QCOMPARE(line("localNameEdit"), QStringLiteral("Voll"));
    QCOMPARE(line("iconEdit"), QStringLiteral("folder"));
    QCOMPARE(line("localIconEdit"), QStringLiteral("folder-de"));
    QCOMPARE(line("execEdit"), QStringLiteral("/bin/sh -c true %u"));
    QVERIFY(child<QCheckBox>(&form, "terminalCheckBox")->isChecked());
    QCOMPARE(line("pathEdit"), QStringLiteral("/tmp"));
    QCOMPARE(line("tryExecEdit"), QStringLiteral("/bin/sh"));
    QCOMPARE(line("genericNameEdit"), QStringLiteral("Generic"));
    QCOMPARE(line("localGenericNameEdit"), QStringLiteral("Allgemein"));
    QCOMPARE(line("commentEdit"), QStringLiteral("Does all"));
    QCOMPARE(line("localCommentEdit"), QStringLiteral("Macht alles"));
    QVERIFY(!child<QCheckBox>(&form, "noDisplayCheckBox")->isChecked());
    QVERIFY(!child<QCheckBox>(&form, "hiddenCheckBox")->isChecked());
    QCOMPARE(line("onlyShowInEdit"), QStringLiteral("VEL;Other;"));
    QCOMPARE(line("notShowInEdit"), QString());
    QCOMPARE(line("mimeTypeEdit"), QStringLiteral("text/plain;image/png;"));
    QCOMPARE(line("categoriesEdit"), QStringLiteral("Utility;Qt;"));
    QCOMPARE(line("keywordsEdit"), QStringLiteral("one;two;"));
    QCOMPARE(line("localKeywordsEdit"), QStringLiteral("eins;zwei;"));
    QVERIFY(child<QCheckBox>(&form, "startupNotifyCheckBox")->isChecked());
    QCOMPARE(line("startupWMClassEdit"), QStringLiteral("Full"));
    QCOMPARE(line("actionsEdit"), QStringLiteral("new;quit;"));
    QCOMPARE(line("versionEdit"), QStringLiteral("1.5"));

    form.loadFrom(entry(EntrySamples::link()));
    QCOMPARE(typeBox(form)->currentData().toString(), link);
    QCOMPARE(line("urlEdit"), QStringLiteral("https://www.freedesktop.org"));
    QCOMPARE(line("execEdit"), QString());
}

void tst_VelDesktopEntryPropsWidgetRecords::showsTheBeginningOfLongValues()
{
    VelDesktopEntryPropsWidget form;
    for (const QByteArray &bytes : {EntrySamples::fullApplication(), EntrySamples::link()}) {
        form.loadFrom(entry(bytes));
        for (const QLineEdit *line : form.findChildren<QLineEdit *>())
            QCOMPARE(line->cursorPosition(), 0);
    }
}

void tst_VelDesktopEntryPropsWidgetRecords::savesEveryKey()
{
    VelDesktopEntryPropsWidget form;
    const VelUIDesktopEntry full = entry(EntrySamples::fullApplication());
    form.loadFrom(full);
    VelUIDesktopEntry copy;
    form.saveTo(&copy);
    QCOMPARE(copy.getType(), application);
    QCOMPARE(copy.getName(), full.getName());
    QCOMPARE(copy.getLocalName(), full.getLocalName());
    QCOMPARE(copy.getIcon(), full.getIcon());
    QCOMPARE(copy.getLocalIcon(), full.getLocalIcon());
    QCOMPARE(copy.getExec(), full.getExec());
    QCOMPARE(copy.getTerminal(), true);
    QCOMPARE(copy.getPath(), full.getPath());
    QCOMPARE(copy.getTryExec(), full.getTryExec());
    QCOMPARE(copy.getGenericName(), full.getGenericName());
    QCOMPARE(copy.getLocalGenericName(), full.getLocalGenericName());
    QCOMPARE(copy.getComment(), full.getComment());
    QCOMPARE(copy.getLocalComment(), full.getLocalComment());
    QCOMPARE(copy.getOnlyShowIn(), full.getOnlyShowIn());
    QCOMPARE(copy.getMimeType(), full.getMimeType());
    QCOMPARE(copy.getCategories(), full.getCategories());
    QCOMPARE(copy.getKeywords(), full.getKeywords());
    QCOMPARE(copy.getLocalKeywords(), full.getLocalKeywords());
    QCOMPARE(copy.getStartupNotify(), true);
    QCOMPARE(copy.getStartupWMClass(), full.getStartupWMClass());
    QCOMPARE(ActionSamples::ids(copy.getActions()), ActionSamples::ids(full.getActions()));
    QCOMPARE(copy.getVersion(), full.getVersion());

    child<QCheckBox>(&form, "noDisplayCheckBox")->click();
    child<QCheckBox>(&form, "hiddenCheckBox")->click();
    form.saveTo(&copy);
    QVERIFY(copy.getNoDisplay() && copy.getHidden());

    form.loadFrom(entry(EntrySamples::link()));
    VelUIDesktopEntry page;
    form.saveTo(&page);
    QCOMPARE(page.getType(), link);
    QCOMPARE(page.getURL(), QStringLiteral("https://www.freedesktop.org"));
}

void tst_VelDesktopEntryPropsWidgetRecords::writesNothingForNull()
{
    VelDesktopEntryPropsWidget form;
    form.loadFrom(entry(EntrySamples::link()));
    form.saveTo(nullptr);
    QCOMPARE(child<QLineEdit>(&form, "nameEdit")->text(), QStringLiteral("Page"));
}

void tst_VelDesktopEntryPropsWidgetRecords::changesNothingInARecordThatItLoaded()
{
    for (const QByteArray &bytes :
         {EntrySamples::fullApplication(), EntrySamples::link(), EntrySamples::directory()}) {
        VelDesktopEntryPropsWidget form;
        VelUIDesktopEntry record = entry(bytes);
        form.loadFrom(record);
        form.saveTo(&record);
        QVERIFY(record.save());
        QCOMPARE(read(path(QStringLiteral("entry.desktop"))), bytes);
    }
}

void tst_VelDesktopEntryPropsWidgetRecords::takesOnlyTheTypeOfAnInvalidRecord()
{
    VelDesktopEntryPropsWidget form;
    form.loadFrom(entry(EntrySamples::fullApplication()));
    VelUIDesktopEntry invalid;
    invalid.setType(directory);
    invalid.setName(QStringLiteral("ignored"));
    QVERIFY(!invalid.isValid());
    form.loadFrom(invalid);
    QCOMPARE(typeBox(form)->currentData().toString(), directory);
    QCOMPARE(child<QLineEdit>(&form, "nameEdit")->text(), QStringLiteral("Full"));
}

void tst_VelDesktopEntryPropsWidgetRecords::keepsOddValues_data()
{
    QTest::addColumn<QString>("value");
    QTest::newRow("leading blanks") << QStringLiteral("  two");
    QTest::newRow("trailing blanks") << QStringLiteral("two  ");
    QTest::newRow("tab") << QStringLiteral("\ta\tb");
    QTest::newRow("semicolons") << QStringLiteral("a;b;;c\\;");
    QTest::newRow("backslashes") << QStringLiteral("\\n \\s \\\\ \\x");
    QTest::newRow("line feed") << QStringLiteral("one\ntwo\r\nthree");
    QTest::newRow("group") << QStringLiteral("a\n[Desktop Action x]\nExec=rm");
    QTest::newRow("other scripts") << QString::fromUtf8("Ж שלום 漢字 \xF0\x9F\x98\x80");
    QTest::newRow("long") << QString(40000, QLatin1Char('x'));
}

void tst_VelDesktopEntryPropsWidgetRecords::keepsOddValues()
{
    QFETCH(QString, value);
    VelDesktopEntryPropsWidget form;
    VelUIDesktopEntry record = entry(EntrySamples::fullApplication());
    form.loadFrom(record);
    const QStringList lines{QStringLiteral("nameEdit"), QStringLiteral("localNameEdit"),
                            QStringLiteral("localCommentEdit"), QStringLiteral("pathEdit")};
    for (const QString &name : lines)
        form.findChild<QLineEdit *>(name)->setText(value);
    child<PathEdit>(&form, "execEdit")->setText(value);
    child<StringListEdit>(&form, "localKeywordsEdit")->setStrings({value, QStringLiteral("b"), value});
    form.saveTo(&record);
    saved(record);

    VelUIDesktopEntry again(path(QStringLiteral("saved.desktop")));
    QVERIFY(again.load());
    VelDesktopEntryPropsWidget other;
    other.loadFrom(again);
    for (const QString &name : lines)
        QCOMPARE(other.findChild<QLineEdit *>(name)->text(), value);
    QCOMPARE(child<PathEdit>(&other, "execEdit")->text(), value);
    QCOMPARE(child<StringListEdit>(&other, "localKeywordsEdit")->strings(),
             QStringList({value, QStringLiteral("b"), value}));
    QCOMPARE(ActionSamples::ids(again.getActions()),
             QStringList({QStringLiteral("new"), QStringLiteral("quit")}));
}

void tst_VelDesktopEntryPropsWidgetRecords::keepsAPastedLineFeed()
{
    VelDesktopEntryPropsWidget form;
    child<QLineEdit>(&form, "nameEdit")->insert(QStringLiteral("a\nb"));
    VelUIDesktopEntry record;
    form.saveTo(&record);
    QCOMPARE(record.getName(), QStringLiteral("a\nb"));
    QVERIFY(saved(record).contains("Name=a\\nb\n"));
}

void tst_VelDesktopEntryPropsWidgetRecords::keepsOddActions()
{
    VelUIDesktopAction action(QStringLiteral("odd;id"));
    action.setName(QStringLiteral("  a;b\nc\\n"));
    action.setExec(QStringLiteral(" run \\ %u\t"));
    action.setOnlyShowIn({QStringLiteral("a;b"), QStringLiteral(" c")});
    VelDesktopEntryPropsWidget form;
    VelUIDesktopEntry record = entry(EntrySamples::fullApplication());
    form.loadFrom(record);
    child<ActionListEdit>(&form, "actionsEdit")->setActions({action});
    form.saveTo(&record);
    saved(record);

    VelUIDesktopEntry again(path(QStringLiteral("saved.desktop")));
    QVERIFY(again.load());
    form.loadFrom(again);
    const QList<VelUIDesktopAction> actions = child<ActionListEdit>(&form, "actionsEdit")->actions();
    QCOMPARE(actions.size(), 1);
    QCOMPARE(actions.constFirst().getId(), action.getId());
    QCOMPARE(actions.constFirst().getName(), action.getName());
    QCOMPARE(actions.constFirst().getExec(), action.getExec());
    QCOMPARE(actions.constFirst().getOnlyShowIn(), action.getOnlyShowIn());
}

VEL_TEST_MAIN(tst_VelDesktopEntryPropsWidgetRecords)

#include "tst_VelDesktopEntryPropsWidgetRecords.moc"
