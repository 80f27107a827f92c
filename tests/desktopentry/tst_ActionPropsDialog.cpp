// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ActionSamples.h"
#include "FormDriving.h"
#include "TestCase.h"

#include <desktopentry/ActionPropsDialog.h>
#include <desktopentry/FormLayout.h>
#include <desktopentry/IconEdit.h>
#include <desktopentry/PathEdit.h>
#include <desktopentry/StringListEdit.h>

#include <KIconButton>

#include <QButtonGroup>
#include <QListWidget>
#include <QRadioButton>
#include <QToolButton>

using namespace FormDriving;
using namespace VelUI;

namespace {

VelUIDesktopAction fullAction()
{
    VelUIDesktopAction action(QStringLiteral("new-window"));
    action.setName(QStringLiteral(" New; Window "));
    action.setLocalName(QStringLiteral("Neues\nFenster"));
    action.setIcon(QStringLiteral("window-new"));
    action.setLocalIcon(QStringLiteral("window-neu"));
    action.setExec(QStringLiteral("app --new \\ %u "));
    action.setOnlyShowIn({QStringLiteral("VEL"), QStringLiteral("a;b")});
    return action;
}

QLineEdit *lineIn(QWidget *field)
{
    return field->findChild<QLineEdit *>();
}

} // namespace

class tst_ActionPropsDialog : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();
    void hasTheRowsInTheirOrder();
    void opensWithOkDisabled();
    void enablesOkForAChangeInAnyField_data();
    void enablesOkForAChangeInAnyField();
    void enablesOkForAChosenIcon();
    void enablesOkForAnEditedList_data();
    void enablesOkForAnEditedList();
    void togglingTheRadioButtonsIsNoChange();
    void needsIdNameAndCommand_data();
    void needsIdNameAndCommand();
    void checksTheRadioButtonOfTheListThatIsSet();
    void enablesTheListOfTheCheckedButton();
    void keepsOnlyTheChosenList();
    void givesBackWhatItWasGiven();
    void namesTheListDialogs();
    void reachesEveryRowByTab();
    void showsTheBeginningOfLongValues();
    void acceptsAndRejectsByItsButtons();
};

void tst_ActionPropsDialog::init()
{
    TestCase::init();
    qputenv("LANG", "de_DE.UTF-8");
}

void tst_ActionPropsDialog::cleanup()
{
    qputenv("LANG", "C.UTF-8");
    TestCase::cleanup();
}

void tst_ActionPropsDialog::hasTheRowsInTheirOrder()
{
    ActionPropsDialog dialog(fullAction());
    auto *form = dialog.findChild<FormLayout *>();
    QVERIFY(form);
    QStringList labels;
    QStringList bold;
    QStringList fields;
    for (int row = 0; row < form->rowCount(); ++row) {
        if (!form->itemAtPosition(row, 0))
            continue;
        QWidget *left = form->itemAtPosition(row, 0)->widget();
        auto *label = qobject_cast<QLabel *>(left);
        labels.append(label ? label->text() : qobject_cast<QRadioButton *>(left)->text());
        if (left->font().weight() == QFont::Bold)
            bold.append(labels.constLast());
        fields.append(QString::fromLatin1(form->itemAtPosition(row, 1)->widget()->metaObject()->className()));
    }
    QCOMPARE(labels.join(QLatin1Char('|')),
             QStringLiteral("Id:|Name:|Name [de]:|Icon:|Icon [de]:|Only show in|Not show in|Exec:"));
    QCOMPARE(bold.join(QLatin1Char('|')), QStringLiteral("Id:|Name:|Exec:"));
    QCOMPARE(fields.join(QLatin1Char('|')),
             QStringLiteral("QLineEdit|QLineEdit|QLineEdit|VelUI::IconEdit|VelUI::IconEdit|"
                            "VelUI::StringListEdit|VelUI::StringListEdit|VelUI::PathEdit"));
    QCOMPARE(dialog.findChild<QDialogButtonBox *>()->standardButtons(),
             QDialogButtonBox::Ok | QDialogButtonBox::Cancel);
    auto *group = dialog.findChild<QButtonGroup *>();
    QVERIFY(group && group->exclusive());
    QCOMPARE(group->buttons().size(), 2);
}

void tst_ActionPropsDialog::opensWithOkDisabled()
{
    ActionPropsDialog dialog(fullAction());
    QVERIFY(!okButton(&dialog)->isEnabled());
    dialog.setChanged(true);
    QVERIFY(okButton(&dialog)->isEnabled());
    dialog.setChanged(false);
    QVERIFY(!okButton(&dialog)->isEnabled());
}

void tst_ActionPropsDialog::enablesOkForAChangeInAnyField_data()
{
    QTest::addColumn<QString>("field");
    for (const char *name : {"idEdit", "nameEdit", "localNameEdit", "iconEdit", "localIconEdit", "execEdit"})
        QTest::newRow(name) << QString::fromLatin1(name);
}

void tst_ActionPropsDialog::enablesOkForAChangeInAnyField()
{
    QFETCH(QString, field);
    ActionPropsDialog dialog(fullAction());
    auto *widget = dialog.findChild<QWidget *>(field);
    QVERIFY(widget);
    auto *line = qobject_cast<QLineEdit *>(widget);
    QTest::keyClicks(line ? line : lineIn(widget), QStringLiteral("x"));
    QVERIFY(okButton(&dialog)->isEnabled());
}

void tst_ActionPropsDialog::enablesOkForAChosenIcon()
{
    ActionPropsDialog dialog(fullAction());
    auto *icon = child<IconEdit>(&dialog, "localIconEdit");
    Q_EMIT icon->findChild<KIconButton *>()->iconChanged(QStringLiteral("folder"));
    QVERIFY(okButton(&dialog)->isEnabled());
    QCOMPARE(dialog.action().getLocalIcon(), QStringLiteral("folder"));
}

void tst_ActionPropsDialog::enablesOkForAnEditedList_data()
{
    QTest::addColumn<QString>("button");
    QTest::addColumn<QString>("list");
    QTest::newRow("only show in") << QStringLiteral("onlyShowInButton") << QStringLiteral("onlyShowInEdit");
    QTest::newRow("not show in") << QStringLiteral("notShowInButton") << QStringLiteral("notShowInEdit");
}

void tst_ActionPropsDialog::enablesOkForAnEditedList()
{
    QFETCH(QString, button);
    QFETCH(QString, list);
    ActionPropsDialog dialog(fullAction());
    auto *edit = dialog.findChild<StringListEdit *>(list);
    edit->setStrings({QStringLiteral("gone"), QStringLiteral("a;b")});
    dialog.findChild<QRadioButton *>(button)->click();
    ModalDriver modal;
    modal.handle([](QWidget *window) {
        window->findChild<QListWidget *>()->setCurrentRow(0);
        click(child<QPushButton>(window, "deleteButton"));
        click(okButton(window));
    });
    click(edit->findChild<QToolButton *>());
    QVERIFY(modal.finished());
    QVERIFY(okButton(&dialog)->isEnabled());
    QCOMPARE(edit->strings(), QStringList({QStringLiteral("a;b")}));
}

void tst_ActionPropsDialog::togglingTheRadioButtonsIsNoChange()
{
    ActionPropsDialog dialog(fullAction());
    child<QRadioButton>(&dialog, "notShowInButton")->click();
    QVERIFY(!okButton(&dialog)->isEnabled());
}

void tst_ActionPropsDialog::needsIdNameAndCommand_data()
{
    enablesOkForAChangeInAnyField_data();
}

void tst_ActionPropsDialog::needsIdNameAndCommand()
{
    QFETCH(QString, field);
    ActionPropsDialog dialog(fullAction());
    auto *widget = dialog.findChild<QWidget *>(field);
    auto *line = qobject_cast<QLineEdit *>(widget);
    retype(line ? line : lineIn(widget), QStringLiteral(" \t"));
    const bool needed = field == QLatin1String("idEdit") || field == QLatin1String("nameEdit")
        || field == QLatin1String("execEdit");
    QCOMPARE(okButton(&dialog)->isEnabled(), !needed);
}

void tst_ActionPropsDialog::checksTheRadioButtonOfTheListThatIsSet()
{
    VelUIDesktopAction action = fullAction();
    ActionPropsDialog only(action);
    QVERIFY(child<QRadioButton>(&only, "onlyShowInButton")->isChecked());
    action.setNotShowIn({QStringLiteral("X")});
    ActionPropsDialog both(action);
    QVERIFY(child<QRadioButton>(&both, "notShowInButton")->isChecked());
    QVERIFY(child<StringListEdit>(&both, "notShowInEdit")->isEnabled());
    QVERIFY(!child<StringListEdit>(&both, "onlyShowInEdit")->isEnabled());
    ActionPropsDialog none(VelUIDesktopAction(QStringLiteral("x")));
    QVERIFY(child<QRadioButton>(&none, "onlyShowInButton")->isChecked());
}

void tst_ActionPropsDialog::enablesTheListOfTheCheckedButton()
{
    ActionPropsDialog dialog(fullAction());
    auto *only = child<StringListEdit>(&dialog, "onlyShowInEdit");
    auto *no = child<StringListEdit>(&dialog, "notShowInEdit");
    QVERIFY(only->isEnabled() && !no->isEnabled());
    child<QRadioButton>(&dialog, "notShowInButton")->click();
    QVERIFY(!only->isEnabled() && no->isEnabled());
    child<QRadioButton>(&dialog, "onlyShowInButton")->click();
    QVERIFY(only->isEnabled() && !no->isEnabled());
}

void tst_ActionPropsDialog::keepsOnlyTheChosenList()
{
    ActionPropsDialog dialog(fullAction());
    child<QRadioButton>(&dialog, "notShowInButton")->click();
    child<StringListEdit>(&dialog, "notShowInEdit")->setStrings({QStringLiteral("Y")});
    QCOMPARE(dialog.action().getNotShowIn(), QStringList({QStringLiteral("Y")}));
    QCOMPARE(dialog.action().getOnlyShowIn(), QStringList());

    child<QRadioButton>(&dialog, "onlyShowInButton")->click();
    QCOMPARE(dialog.action().getOnlyShowIn(), fullAction().getOnlyShowIn());
    QVERIFY(!fullAction().getOnlyShowIn().isEmpty());
    QCOMPARE(dialog.action().getNotShowIn(), QStringList());
}

void tst_ActionPropsDialog::givesBackWhatItWasGiven()
{
    const VelUIDesktopAction action = fullAction();
    const VelUIDesktopAction result = ActionPropsDialog(action).action();
    QCOMPARE(result.getId(), action.getId());
    QCOMPARE(result.getName(), action.getName());
    QCOMPARE(result.getLocalName(), action.getLocalName());
    QCOMPARE(result.getIcon(), action.getIcon());
    QCOMPARE(result.getLocalIcon(), action.getLocalIcon());
    QCOMPARE(result.getExec(), action.getExec());
    QCOMPARE(result.getOnlyShowIn(), action.getOnlyShowIn());
    QCOMPARE(result.getNotShowIn(), action.getNotShowIn());
}

void tst_ActionPropsDialog::namesTheListDialogs()
{
    ActionPropsDialog dialog(fullAction());
    child<QRadioButton>(&dialog, "notShowInButton")->click();
    Prompt add;
    Prompt edit;
    ModalDriver modal;
    modal.handle([&](QWidget *window) {
        QCOMPARE(window->windowTitle(), QStringLiteral("Not show in"));
        answerPrompt(modal, QStringLiteral("Z"), &add);
        click(child<QPushButton>(window, "addButton"));
        window->findChild<QListWidget *>()->setCurrentRow(0);
        answerPrompt(modal, QString(), &edit);
        click(child<QPushButton>(window, "editButton"));
        window->close();
    });
    child<StringListEdit>(&dialog, "notShowInEdit")->editStrings();
    QVERIFY(modal.finished());
    QCOMPARE(add.title, QStringLiteral("Not show in"));
    QCOMPARE(add.label, QStringLiteral("Add desktop environment:"));
    QCOMPARE(edit.title, QStringLiteral("Not show in"));
    QCOMPARE(edit.label, QStringLiteral("Edit desktop environment:"));
}

void tst_ActionPropsDialog::reachesEveryRowByTab()
{
    ActionPropsDialog dialog(fullAction());
    dialog.show();
    QVERIFY(QTest::qWaitForWindowActive(&dialog));
    child<QLineEdit>(&dialog, "idEdit")->setFocus();
    QStringList names;
    for (int i = 0; i < 30 && !qobject_cast<QDialogButtonBox *>(dialog.focusWidget()->parentWidget()); ++i) {
        auto *button = qobject_cast<QAbstractButton *>(dialog.focusWidget());
        const QString name = dialog.focusWidget()->accessibleName();
        names.append(name.isEmpty() && button ? button->text() : name);
        QTest::keyClick(dialog.focusWidget(), Qt::Key_Tab);
    }
    QCOMPARE(
        names.join(QLatin1Char('|')),
        QStringLiteral("Id|Name|Name [de]|Icon|Edit Icon|Icon [de]|Edit Icon [de]|Only show in|Only show in|"
                       "Edit Only show in|Not show in|Exec|Edit Exec"));
}

void tst_ActionPropsDialog::showsTheBeginningOfLongValues()
{
    ActionPropsDialog dialog(fullAction());
    for (const QLineEdit *line : dialog.findChildren<QLineEdit *>())
        QCOMPARE(line->cursorPosition(), 0);
}

void tst_ActionPropsDialog::acceptsAndRejectsByItsButtons()
{
    ActionPropsDialog dialog(fullAction());
    dialog.setChanged(true);
    QCOMPARE(runAndPress(dialog, okButton), int(QDialog::Accepted));
    QCOMPARE(runAndPress(dialog, cancelButton), int(QDialog::Rejected));
}

VEL_TEST_MAIN(tst_ActionPropsDialog)

#include "tst_ActionPropsDialog.moc"
