// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ActionSamples.h"
#include "FormDriving.h"
#include "TestCase.h"

#include <desktopentry/ActionListEdit.h>
#include <desktopentry/EditActionsDialog.h>

#include <QLayout>
#include <QListWidget>
#include <QSignalSpy>
#include <QToolButton>

using namespace FormDriving;
using namespace VelUI;
using ActionSamples::actions;
using ActionSamples::ids;

class tst_ActionListEdit : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void looksLikeItsForm();
    void showsTheIds();
    void hidesTheButtonWhenReadOnly();
    void takesTheAcceptedActions();
    void keepsTheActionsWhenCanceled();
    void givesItsTextsToTheDialogs();
};

void tst_ActionListEdit::looksLikeItsForm()
{
    ActionListEdit edit;
    QCOMPARE(edit.objectName(), QStringLiteral("ActionListEdit"));
    QCOMPARE(edit.windowTitle(), QStringLiteral("Form"));
    QCOMPARE(edit.size(), QSize(571, 32));
    QCOMPARE(edit.layout()->objectName(), QStringLiteral("horizontalLayout"));
    QCOMPARE(edit.layout()->contentsMargins(), QMargins());
    QVERIFY(child<QLineEdit>(&edit, "actionListShow")->isReadOnly());
    auto *button = child<QToolButton>(&edit, "editActionsButton");
    QCOMPARE(button->text(), QStringLiteral("..."));
    QCOMPARE(button->sizePolicy().horizontalPolicy(), QSizePolicy::Fixed);
    QCOMPARE(button->sizePolicy().verticalPolicy(), QSizePolicy::Preferred);
}

void tst_ActionListEdit::showsTheIds()
{
    ActionListEdit edit;
    auto *line = child<QLineEdit>(&edit, "actionListShow");
    QSignalSpy changed(&edit, &ActionListEdit::changed);
    edit.setActions(actions({"new", "quit"}));
    QCOMPARE(line->text(), QStringLiteral("new;quit;"));
    line->setReadOnly(false);
    edit.setActions({});
    QCOMPARE(line->text(), QString());
    QVERIFY(line->isReadOnly());
    QCOMPARE(changed.count(), 0);
}

void tst_ActionListEdit::hidesTheButtonWhenReadOnly()
{
    ActionListEdit edit;
    edit.show();
    auto *button = child<QToolButton>(&edit, "editActionsButton");
    edit.setReadOnly(true);
    QVERIFY(!button->isVisible());
    edit.setReadOnly(false);
    QVERIFY(button->isVisible());
    QVERIFY(child<QLineEdit>(&edit, "actionListShow")->isReadOnly());
}

void tst_ActionListEdit::takesTheAcceptedActions()
{
    ActionListEdit edit;
    edit.setActions(actions({"a", "b"}));
    edit.show();
    QSignalSpy changed(&edit, &ActionListEdit::changed);
    ModalDriver modal;
    modal.handle([&edit](QWidget *window) {
        auto *dialog = qobject_cast<EditActionsDialog *>(window);
        QVERIFY(dialog);
        QCOMPARE(dialog->parentWidget(), &edit);
        dialog->findChild<QListWidget *>()->setCurrentRow(0);
        click(child<QPushButton>(dialog, "downButton"));
        click(okButton(dialog));
    });
    click(child<QToolButton>(&edit, "editActionsButton"));
    QVERIFY(modal.finished());
    QCOMPARE(ids(edit.actions()), QStringList({QStringLiteral("b"), QStringLiteral("a")}));
    QCOMPARE(child<QLineEdit>(&edit, "actionListShow")->text(), QStringLiteral("b;a;"));
    QCOMPARE(changed.count(), 1);
}

void tst_ActionListEdit::keepsTheActionsWhenCanceled()
{
    ActionListEdit edit;
    edit.setActions(actions({"a", "b"}));
    QSignalSpy changed(&edit, &ActionListEdit::changed);
    ModalDriver modal;
    modal.handle([](QWidget *window) {
        window->findChild<QListWidget *>()->setCurrentRow(0);
        click(child<QPushButton>(window, "deleteButton"));
        click(cancelButton(window));
    });
    edit.editActions();
    QVERIFY(modal.finished());
    QCOMPARE(ids(edit.actions()), QStringList({QStringLiteral("a"), QStringLiteral("b")}));
    QCOMPARE(changed.count(), 0);
}

void tst_ActionListEdit::givesItsTextsToTheDialogs()
{
    ActionListEdit edit;
    edit.setActions(actions({"a"}));
    QStringList titles;
    const auto run = [&edit, &titles] {
        ModalDriver modal;
        modal.handle([&titles, &modal](QWidget *window) {
            titles.append(window->windowTitle());
            modal.handle([&titles](QWidget *inner) {
                titles.append(inner->windowTitle());
                inner->close();
            });
            click(child<QPushButton>(window, "addButton"));
            window->close();
        });
        edit.editActions();
        QVERIFY(modal.finished());
    };
    run();
    edit.setTexts(QStringLiteral("Actions"), QStringLiteral("plus"), QStringLiteral("change"));
    run();
    // One alone makes the other of the dialog give way too.
    edit.setTexts(QStringLiteral("Actions"), QString(), QStringLiteral("change"));
    run();
    QCOMPARE(titles,
             QStringList({QString(), QStringLiteral("Add action"), QStringLiteral("Actions"),
                          QStringLiteral("plus"), QStringLiteral("Actions"), QString()}));
}

VEL_TEST_MAIN(tst_ActionListEdit)

#include "tst_ActionListEdit.moc"
