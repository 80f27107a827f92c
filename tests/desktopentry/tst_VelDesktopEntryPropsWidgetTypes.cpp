// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EntrySamples.h"
#include "FormDriving.h"
#include "PropsFormTestCase.h"

#include <VelDesktopEntryPropsWidget.h>
#include <desktopentry/ActionListEdit.h>
#include <desktopentry/IconEdit.h>
#include <desktopentry/PathEdit.h>
#include <desktopentry/StringListEdit.h>
#include <frame/DesktopEntryRecord.h>

#include <QAbstractItemView>
#include <QCheckBox>
#include <QComboBox>
#include <QPointer>
#include <QSignalSpy>
#include <QWheelEvent>

using namespace FormDriving;
using namespace VelUI;

namespace {

const ModalDriver::Box typeQuestion{
    QMessageBox::Question, QStringLiteral("Attention"),
    QStringLiteral("Desktop entry type was changed.\nSome field values may be lost...\nContinue?"),
    QMessageBox::Yes, QMessageBox::NoButton};

// Turns the wheel towards the user over \a widget; whether it took that.
bool turnWheel(QWidget *widget)
{
    const QPointF at(5, 5);
    QWheelEvent event(at, widget->mapToGlobal(at.toPoint()), QPoint(), QPoint(0, -120), Qt::NoButton,
                      Qt::NoModifier, Qt::NoScrollPhase, false);
    QApplication::sendEvent(widget, &event);
    return event.isAccepted();
}

} // namespace

/// The type of the entry: which may be chosen, what it shows, and what a change of it takes away.
class tst_VelDesktopEntryPropsWidgetTypes : public PropsFormTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void showsTheRowsOfTheType_data();
    void showsTheRowsOfTheType();
    void refusesATypeThatIsNotAllowed_data();
    void refusesATypeThatIsNotAllowed();
    void allowsAllTypesForAnEmptyList();
    void refillsTheTypesWithoutAsking();
    void loadsARecordOfATypeThatIsNotAllowedAsTheCurrentOne();
    void asksBeforeTheTypeChanges();
    void takesClosingAndEscapingForYes_data();
    void takesClosingAndEscapingForYes();
    void restoresTheTypeOnAnyOtherAnswer();
    void survivesItsDeletionBehindTheQuestion();
    void emptiesTheRowsOfTheOldType();
    void bringsBackWhatTheUserEmptiedByTheType();
    void bringsBackNothingOfAnotherEntry();
    void keepsATypeThatItDoesNotKnow_data();
    void keepsATypeThatItDoesNotKnow();
    void takesTheTypeShownWhenTheUserChoosesIt();
    void keepsTheCommonRowsWhenTheTypeChanges();
    void savesNothingOfTheOldType();
    void ignoresTheWheelOverTheTypeWithoutFocus();
    void asksWhenTheWheelTurnsOverTheFocusedType();
};

void tst_VelDesktopEntryPropsWidgetTypes::showsTheRowsOfTheType_data()
{
    QTest::addColumn<QString>("type");
    QTest::addColumn<QStringList>("allowed");
    QTest::addColumn<bool>("typeRow");
    QTest::newRow("application") << application << QStringList() << true;
    QTest::newRow("link") << link << QStringList() << true;
    QTest::newRow("directory") << directory << QStringList() << true;
    QTest::newRow("application alone") << application << QStringList{application} << true;
    QTest::newRow("link alone") << link << QStringList{link} << true;
    QTest::newRow("directory alone") << directory << QStringList{directory} << false;
    QTest::newRow("one of two") << directory << QStringList{directory, link} << true;
}

void tst_VelDesktopEntryPropsWidgetTypes::showsTheRowsOfTheType()
{
    QFETCH(QString, type);
    QFETCH(QStringList, allowed);
    QFETCH(bool, typeRow);
    VelDesktopEntryPropsWidget form;
    form.setType(type, allowed);
    QCOMPARE(typeBox(form)->currentData().toString(), type);
    QCOMPARE(typeBox(form)->count(), allowed.isEmpty() ? 3 : allowed.size());

    const QStringList rows = shownRows(form);
    QCOMPARE(rows.contains(QStringLiteral("Type:")), typeRow);
    for (const char *row : {"Exec:*", "Terminal", "Path:", "Try exec:", "MIME type:", "Categories:",
                            "Keywords:", "Keywords [de]:", "Startup notify", "Startup WM class:", "Actions:"})
        QCOMPARE(rows.contains(QLatin1String(row)), type == application);
    QCOMPARE(rows.contains(QStringLiteral("Url:*")), type == link);
    for (const char *row :
         {"Name:*", "Name [de]:", "Icon:", "Icon [de]:", "Generic name:", "Generic name [de]:", "Comment:",
          "Comment [de]:", "No display", "Hidden", "Only show in", "Not show in", "Version:"})
        QVERIFY2(rows.contains(QLatin1String(row)), row);
    QCOMPARE(child<StringListEdit>(&form, "keywordsEdit")->isHidden(), type != application);
    QCOMPARE(child<QLineEdit>(&form, "urlEdit")->isHidden(), type != link);
}

void tst_VelDesktopEntryPropsWidgetTypes::refusesATypeThatIsNotAllowed_data()
{
    QTest::addColumn<QString>("type");
    QTest::addColumn<QStringList>("allowed");
    QTest::newRow("empty") << QString() << QStringList{link};
    QTest::newRow("not in the list") << directory << QStringList{application, link};
    QTest::newRow("other case") << QStringLiteral("link") << QStringList{application, link};
    QTest::newRow("unknown") << QStringLiteral("Service") << QStringList();
}

void tst_VelDesktopEntryPropsWidgetTypes::refusesATypeThatIsNotAllowed()
{
    QFETCH(QString, type);
    QFETCH(QStringList, allowed);
    VelDesktopEntryPropsWidget form;
    form.setType(type, allowed);
    QCOMPARE(typeBox(form)->currentData().toString(), application);
    QCOMPARE(typeBox(form)->count(), 3);
    QVERIFY(shownRows(form).contains(QStringLiteral("Exec:*")));
}

void tst_VelDesktopEntryPropsWidgetTypes::allowsAllTypesForAnEmptyList()
{
    VelDesktopEntryPropsWidget form;
    form.setType(link, {link});
    QCOMPARE(typeBox(form)->count(), 1);
    form.setType(link, {});
    QCOMPARE(typeBox(form)->count(), 3);
    QCOMPARE(typeBox(form)->currentData().toString(), link);
}

void tst_VelDesktopEntryPropsWidgetTypes::refillsTheTypesWithoutAsking()
{
    VelDesktopEntryPropsWidget form;
    QSignalSpy changed(&form, &VelDesktopEntryPropsWidget::changed);
    ModalDriver modal;
    form.setType(link, {directory, link});
    form.setType(directory, {});
    form.setType(application, {application});
    QVERIFY(modal.finished());
    QCOMPARE(changed.count(), 0);
}

void tst_VelDesktopEntryPropsWidgetTypes::loadsARecordOfATypeThatIsNotAllowedAsTheCurrentOne()
{
    VelDesktopEntryPropsWidget form;
    form.setType(directory, {directory});
    form.loadFrom(entry(EntrySamples::link()));
    QCOMPARE(typeBox(form)->currentData().toString(), directory);
    QCOMPARE(child<QLineEdit>(&form, "nameEdit")->text(), QStringLiteral("Page"));
    QCOMPARE(child<QLineEdit>(&form, "urlEdit")->text(), QString());
}

void tst_VelDesktopEntryPropsWidgetTypes::asksBeforeTheTypeChanges()
{
    VelDesktopEntryPropsWidget form;
    QSignalSpy changed(&form, &VelDesktopEntryPropsWidget::changed);
    // The new type is in place when the change is told.
    VelUIDesktopEntry toldRecord;
    connect(&form, &VelDesktopEntryPropsWidget::changed, &form,
            [&form, &toldRecord] { form.saveTo(&toldRecord); });
    ModalDriver modal;
    modal.answerWith(typeQuestion, [&form](QMessageBox *box) {
        QCOMPARE(box->parentWidget(), &form);
        QCOMPARE(box->buttons().size(), 1);
        QVERIFY(shownRows(form).contains(QStringLiteral("Exec:*")));
        box->button(QMessageBox::Yes)->click();
    });
    typeBox(form)->setFocus();
    QTest::keyClick(typeBox(form), Qt::Key_Down);
    QVERIFY(modal.finished());
    QCOMPARE(typeBox(form)->currentData().toString(), link);
    QVERIFY(shownRows(form).contains(QStringLiteral("Url:*")));
    QCOMPARE(changed.count(), 1);
    QCOMPARE(toldRecord.getType(), link);
}

void tst_VelDesktopEntryPropsWidgetTypes::takesClosingAndEscapingForYes_data()
{
    QTest::addColumn<bool>("escape");
    QTest::newRow("escape") << true;
    QTest::newRow("close") << false;
}

void tst_VelDesktopEntryPropsWidgetTypes::takesClosingAndEscapingForYes()
{
    QFETCH(bool, escape);
    VelDesktopEntryPropsWidget form;
    ModalDriver modal;
    modal.answerWith(typeQuestion, [escape](QMessageBox *box) {
        if (escape)
            QTest::keyClick(box, Qt::Key_Escape);
        else
            box->close();
    });
    chooseType(form, directory);
    QVERIFY(modal.finished());
    QCOMPARE(typeBox(form)->currentData().toString(), directory);
    QVERIFY(!shownRows(form).contains(QStringLiteral("Exec:*")));
}

void tst_VelDesktopEntryPropsWidgetTypes::restoresTheTypeOnAnyOtherAnswer()
{
    VelDesktopEntryPropsWidget form;
    form.loadFrom(entry(EntrySamples::fullApplication()));
    QSignalSpy changed(&form, &VelDesktopEntryPropsWidget::changed);
    ModalDriver modal;
    modal.answerWith(typeQuestion, [](QMessageBox *box) { box->done(QMessageBox::No); });
    chooseType(form, directory);
    QVERIFY(modal.finished());
    QCOMPARE(typeBox(form)->currentData().toString(), application);
    QCOMPARE(child<PathEdit>(&form, "execEdit")->text(), QStringLiteral("/bin/sh -c true %u"));
    QCOMPARE(changed.count(), 0);
}

void tst_VelDesktopEntryPropsWidgetTypes::survivesItsDeletionBehindTheQuestion()
{
    auto *form = new VelDesktopEntryPropsWidget;
    const QPointer<QWidget> alive(form);
    const QPointer<QComboBox> box(typeBox(*form));
    ModalDriver modal;
    modal.answerWith(typeQuestion, [form](QMessageBox *) { delete form; });
    chooseType(*form, directory);
    QVERIFY(modal.finished());
    QVERIFY(!alive);
    QTRY_VERIFY(!box);
}

void tst_VelDesktopEntryPropsWidgetTypes::emptiesTheRowsOfTheOldType()
{
    VelDesktopEntryPropsWidget form;
    form.loadFrom(entry(EntrySamples::fullApplication()));
    form.setType(directory, {});
    form.setType(application, {});
    for (const char *name : {"execEdit", "tryExecEdit"})
        QCOMPARE(child<PathEdit>(&form, name)->text(), QString());
    for (const char *name : {"pathEdit", "startupWMClassEdit"})
        QCOMPARE(child<QLineEdit>(&form, name)->text(), QString());
    for (const char *name : {"terminalCheckBox", "startupNotifyCheckBox"})
        QVERIFY(!child<QCheckBox>(&form, name)->isChecked());
    for (const char *name : {"mimeTypeEdit", "categoriesEdit", "keywordsEdit", "localKeywordsEdit"})
        QCOMPARE(child<StringListEdit>(&form, name)->strings(), QStringList());
    QVERIFY(child<ActionListEdit>(&form, "actionsEdit")->actions().isEmpty());

    form.loadFrom(entry(EntrySamples::link()));
    form.setType(application, {});
    form.setType(link, {});
    QCOMPARE(child<QLineEdit>(&form, "urlEdit")->text(), QString());
}

void tst_VelDesktopEntryPropsWidgetTypes::bringsBackWhatTheUserEmptiedByTheType()
{
    VelDesktopEntryPropsWidget form;
    form.loadFrom(entry(EntrySamples::fullApplication()));
    ModalDriver modal;
    for (const QString &type : {link, directory, application}) {
        modal.answer(typeQuestion, QMessageBox::Yes);
        chooseType(form, type);
        QVERIFY(modal.finished());
        QCOMPARE(child<PathEdit>(&form, "execEdit")->text().isEmpty(), type != application);
    }
    QCOMPARE(child<PathEdit>(&form, "execEdit")->text(), QStringLiteral("/bin/sh -c true %u"));
    QVERIFY(child<QCheckBox>(&form, "terminalCheckBox")->isChecked());
    QCOMPARE(child<StringListEdit>(&form, "categoriesEdit")->strings(),
             QStringList({QStringLiteral("Utility"), QStringLiteral("Qt")}));
    QCOMPARE(child<ActionListEdit>(&form, "actionsEdit")->actions().size(), 2);
}

void tst_VelDesktopEntryPropsWidgetTypes::bringsBackNothingOfAnotherEntry()
{
    VelDesktopEntryPropsWidget form;
    form.loadFrom(entry(EntrySamples::fullApplication()));
    ModalDriver modal;
    modal.answer(typeQuestion, QMessageBox::Yes);
    chooseType(form, directory);
    form.loadFrom(entry(EntrySamples::link()));
    modal.answer(typeQuestion, QMessageBox::Yes);
    chooseType(form, application);
    QVERIFY(modal.finished());
    QCOMPARE(child<PathEdit>(&form, "execEdit")->text(), QString());
}

void tst_VelDesktopEntryPropsWidgetTypes::keepsATypeThatItDoesNotKnow_data()
{
    QTest::addColumn<QByteArray>("line");
    QTest::newRow("another one") << QByteArray("Type=FSDevice\n");
    QTest::newRow("in lower case") << QByteArray("Type=application\n");
    QTest::newRow("none") << QByteArray();
}

void tst_VelDesktopEntryPropsWidgetTypes::keepsATypeThatItDoesNotKnow()
{
    QFETCH(QByteArray, line);
    const QByteArray bytes = "[Desktop Entry]\n" + line + "Name=a\nExec=/bin/sh\n";
    VelUIDesktopEntry record = entry(bytes);
    VelDesktopEntryPropsWidget form;
    form.loadFrom(record);
    child<QLineEdit>(&form, "nameEdit")->setText(QStringLiteral("b"));
    form.saveTo(&record);
    QVERIFY(record.save());
    QCOMPARE(read(path(QStringLiteral("entry.desktop"))), QByteArray(bytes).replace("Name=a", "Name=b"));
}

void tst_VelDesktopEntryPropsWidgetTypes::takesTheTypeShownWhenTheUserChoosesIt()
{
    VelUIDesktopEntry record = entry("[Desktop Entry]\nType=FSDevice\nName=a\nExec=/bin/sh\n");
    VelDesktopEntryPropsWidget form;
    form.loadFrom(record);
    form.show();
    QVERIFY(QTest::qWaitForWindowActive(&form));
    const QSignalSpy changed(&form, &VelDesktopEntryPropsWidget::changed);
    QComboBox *box = typeBox(form);
    box->showPopup();
    QTest::keyClick(box->view(), Qt::Key_Return);
    QCOMPARE(changed.count(), 1);
    form.saveTo(&record);
    QCOMPARE(record.getType(), application);
}

void tst_VelDesktopEntryPropsWidgetTypes::keepsTheCommonRowsWhenTheTypeChanges()
{
    VelDesktopEntryPropsWidget form;
    form.loadFrom(entry(EntrySamples::fullApplication()));
    form.setType(directory, {});
    QCOMPARE(child<QLineEdit>(&form, "nameEdit")->text(), QStringLiteral("Full"));
    QCOMPARE(child<QLineEdit>(&form, "localCommentEdit")->text(), QStringLiteral("Macht alles"));
    QCOMPARE(child<IconEdit>(&form, "iconEdit")->icon(), QStringLiteral("folder"));
    QCOMPARE(child<StringListEdit>(&form, "onlyShowInEdit")->strings().size(), 2);
    QCOMPARE(child<QLineEdit>(&form, "versionEdit")->text(), QStringLiteral("1.5"));
}

void tst_VelDesktopEntryPropsWidgetTypes::savesNothingOfTheOldType()
{
    VelDesktopEntryPropsWidget form;
    VelUIDesktopEntry record = entry(EntrySamples::fullApplication());
    form.loadFrom(record);
    ModalDriver modal;
    modal.answer(typeQuestion, QMessageBox::Yes);
    chooseType(form, directory);
    QVERIFY(modal.finished());
    form.saveTo(&record);
    QVERIFY(record.save());
    const QByteArray bytes = read(path(QStringLiteral("entry.desktop")));
    QVERIFY(bytes.contains("Type=Directory\n"));
    for (const char *key : {"Exec", "TryExec", "Path", "Terminal", "MimeType", "Categories", "Keywords",
                            "StartupNotify", "StartupWMClass", "Actions", "[Desktop Action"})
        QVERIFY2(!bytes.contains(QByteArray("\n") + key), key);
    QVERIFY(bytes.contains("X-Vendor-Key=keep me\n"));
    QVERIFY(bytes.contains("[X-Group]\nKey=Value\n"));
    QVERIFY(bytes.contains("Name[fr]=Plein\n"));
}

void tst_VelDesktopEntryPropsWidgetTypes::ignoresTheWheelOverTheTypeWithoutFocus()
{
    VelDesktopEntryPropsWidget form;
    form.resize(400, 200);
    form.show();
    QVERIFY(QTest::qWaitForWindowActive(&form));
    child<QLineEdit>(&form, "nameEdit")->setFocus();
    ModalDriver modal;
    // What the box ignores goes on to the form, which scrolls.
    QVERIFY(!turnWheel(typeBox(form)));
    QVERIFY(modal.finished());
    QCOMPARE(typeBox(form)->currentData().toString(), application);
}

void tst_VelDesktopEntryPropsWidgetTypes::asksWhenTheWheelTurnsOverTheFocusedType()
{
    VelDesktopEntryPropsWidget form;
    form.show();
    QVERIFY(QTest::qWaitForWindowActive(&form));
    typeBox(form)->setFocus();
    ModalDriver modal;
    modal.answer(typeQuestion, QMessageBox::Yes);
    QVERIFY(turnWheel(typeBox(form)));
    QVERIFY(modal.finished());
    QCOMPARE(typeBox(form)->currentData().toString(), link);
}

VEL_TEST_MAIN(tst_VelDesktopEntryPropsWidgetTypes)

#include "tst_VelDesktopEntryPropsWidgetTypes.moc"
