// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ActionSamples.h"
#include "FormDriving.h"
#include "QtMajor.h"
#include "TestCase.h"

#include <desktopentry/ActionPropsDialog.h>
#include <desktopentry/EditActionsWidget.h>
#include <desktopentry/PathEdit.h>

#include <QListWidget>
#include <QSignalSpy>

using namespace FormDriving;
using namespace VelUI;
using ActionSamples::actions;
using ActionSamples::ids;

class tst_EditActionsWidget : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void looksLikeTheListOfStrings();
    void knowsActionsAsAMetaType();
    void carriesTheActionsInTheItems();
    void addsAnActionThatWasFilledIn();
    void cannotAddAnActionWithoutFillingIt();
    void addsNothingWhenCanceled();
    void editsTheCurrentAction();
    void leavesTheActionWhenCanceled();
    void opensAnItemWithoutActionAsAnEmptyOne();
    void editsNothingWithoutACurrentItem();
    void namesTheDialogsByTheTextsGiven();
    void enablesTheButtonsByTheSelection();
    void keepsTheButtonsRightWhenActionsComeAndGo();
    void deletesAndMoves();
    void survivesItsDeletionBehindTheDialog();
};

void tst_EditActionsWidget::looksLikeTheListOfStrings()
{
    EditActionsWidget widget;
    QCOMPARE(widget.objectName(), QStringLiteral("EditActionsWidget"));
    QCOMPARE(widget.windowTitle(), QStringLiteral("Form"));
    QCOMPARE(widget.size(), QSize(445, 180));
    QStringList buttons;
    for (const QPushButton *button : widget.findChildren<QPushButton *>()) {
        buttons.append(button->objectName() + QLatin1Char('=') + button->text());
        QCOMPARE(button->isEnabled(), button->objectName() == QLatin1String("addButton"));
    }
    QCOMPARE(buttons.join(QLatin1Char(' ')),
             QStringLiteral(
                 "addButton=Add... editButton=Edit... deleteButton=Delete upButton=Up downButton=Down"));
}

void tst_EditActionsWidget::knowsActionsAsAMetaType()
{
    const QMetaType type(qMetaTypeId<VelUIDesktopAction>());
    QCOMPARE(type.name(), QByteArray("VelUIDesktopAction"));
    const auto flags = type.flags();
    QVERIFY(flags & VelTest::RelocatableType);
    QVERIFY(flags & QMetaType::NeedsConstruction);
    QVERIFY(flags & QMetaType::NeedsDestruction);
}

void tst_EditActionsWidget::carriesTheActionsInTheItems()
{
    EditActionsWidget widget;
    widget.setActions(actions({"old"}));
    widget.setActions(actions({"a", "b"}));
    auto *list = child<QListWidget>(&widget, "listWidget");
    QCOMPARE(list->count(), 2);
    QCOMPARE(list->item(1)->text(), QStringLiteral("b"));
    QCOMPARE(list->item(1)->data(Qt::UserRole).value<VelUIDesktopAction>().getName(),
             QStringLiteral("Name of b"));
    QCOMPARE(ids(widget.actions()), QStringList({QStringLiteral("a"), QStringLiteral("b")}));
    QCOMPARE(widget.actions().at(0).getExec(), QStringLiteral("run-a"));
}

void tst_EditActionsWidget::addsAnActionThatWasFilledIn()
{
    EditActionsWidget widget;
    widget.setActions(actions({"a"}));
    QSignalSpy changed(&widget, &EditActionsWidget::changed);
    ModalDriver modal;
    modal.handle([](QWidget *window) {
        QVERIFY(qobject_cast<ActionPropsDialog *>(window));
        QCOMPARE(window->windowTitle(), QStringLiteral("Add action"));
        QCOMPARE(child<QLineEdit>(window, "idEdit")->text(), QStringLiteral("newAction"));
        retype(child<QLineEdit>(window, "nameEdit"), QStringLiteral("New"));
        retype(child<PathEdit>(window, "execEdit")->findChild<QLineEdit *>(), QStringLiteral("/bin/true"));
        click(okButton(window));
    });
    click(child<QPushButton>(&widget, "addButton"));
    QVERIFY(modal.finished());
    QCOMPARE(ids(widget.actions()), QStringList({QStringLiteral("a"), QStringLiteral("newAction")}));
    QCOMPARE(widget.actions().at(1).getName(), QStringLiteral("New"));
    QCOMPARE(widget.actions().at(1).getExec(), QStringLiteral("/bin/true"));
    QCOMPARE(child<QListWidget>(&widget, "listWidget")->item(1)->text(), QStringLiteral("newAction"));
    QCOMPARE(changed.count(), 1);
}

void tst_EditActionsWidget::cannotAddAnActionWithoutFillingIt()
{
    EditActionsWidget widget;
    ModalDriver modal;
    modal.handle([](QWidget *window) {
        QVERIFY(!okButton(window)->isEnabled());
        retype(child<QLineEdit>(window, "nameEdit"), QStringLiteral("New"));
        QVERIFY(!okButton(window)->isEnabled());
        click(okButton(window));
        window->close();
    });
    widget.addAction();
    QVERIFY(modal.finished());
    QVERIFY(widget.actions().isEmpty());
}

void tst_EditActionsWidget::addsNothingWhenCanceled()
{
    EditActionsWidget widget;
    QSignalSpy changed(&widget, &EditActionsWidget::changed);
    ModalDriver modal;
    modal.handle([](QWidget *window) { click(cancelButton(window)); });
    widget.addAction();
    QVERIFY(modal.finished());
    QVERIFY(widget.actions().isEmpty());
    QCOMPARE(changed.count(), 0);
}

void tst_EditActionsWidget::editsTheCurrentAction()
{
    EditActionsWidget widget;
    widget.setActions(actions({"a", "b"}));
    auto *list = child<QListWidget>(&widget, "listWidget");
    list->setCurrentRow(1);
    QSignalSpy changed(&widget, &EditActionsWidget::changed);
    ModalDriver modal;
    modal.handle([](QWidget *window) {
        QCOMPARE(window->windowTitle(), QStringLiteral("Edit action"));
        QCOMPARE(child<QLineEdit>(window, "nameEdit")->text(), QStringLiteral("Name of b"));
        retype(child<QLineEdit>(window, "idEdit"), QStringLiteral("other"));
        click(okButton(window));
    });
    click(child<QPushButton>(&widget, "editButton"));
    QVERIFY(modal.finished());
    QCOMPARE(changed.count(), 1);
    QCOMPARE(ids(widget.actions()), QStringList({QStringLiteral("a"), QStringLiteral("other")}));
    QCOMPARE(widget.actions().at(1).getExec(), QStringLiteral("run-b"));
    // The old id stays in view until the list is filled again.
    QCOMPARE(list->item(1)->text(), QStringLiteral("b"));
    widget.setActions(widget.actions());
    QCOMPARE(list->item(1)->text(), QStringLiteral("other"));
}

void tst_EditActionsWidget::leavesTheActionWhenCanceled()
{
    EditActionsWidget widget;
    widget.setActions(actions({"a"}));
    child<QListWidget>(&widget, "listWidget")->setCurrentRow(0);
    QSignalSpy changed(&widget, &EditActionsWidget::changed);
    ModalDriver modal;
    modal.handle([](QWidget *window) {
        retype(child<QLineEdit>(window, "nameEdit"), QStringLiteral("x"));
        click(cancelButton(window));
    });
    widget.editAction();
    QVERIFY(modal.finished());
    QCOMPARE(widget.actions().at(0).getName(), QStringLiteral("Name of a"));
    QCOMPARE(changed.count(), 0);
}

void tst_EditActionsWidget::opensAnItemWithoutActionAsAnEmptyOne()
{
    EditActionsWidget widget;
    auto *list = child<QListWidget>(&widget, "listWidget");
    list->addItem(QStringLiteral("stray"));
    list->item(0)->setData(Qt::UserRole, QStringLiteral("no action"));
    list->setCurrentRow(0);
    ModalDriver modal;
    modal.handle([](QWidget *window) {
        QCOMPARE(child<QLineEdit>(window, "idEdit")->text(), QString());
        window->close();
    });
    widget.editAction();
    QVERIFY(modal.finished());
}

void tst_EditActionsWidget::editsNothingWithoutACurrentItem()
{
    EditActionsWidget widget;
    ModalDriver modal;
    widget.editAction();
    QVERIFY(modal.finished());
}

void tst_EditActionsWidget::namesTheDialogsByTheTextsGiven()
{
    EditActionsWidget widget;
    widget.setTexts(QStringLiteral("plus"), QStringLiteral("change"));
    widget.setActions(actions({"a"}));
    child<QListWidget>(&widget, "listWidget")->setCurrentRow(0);
    QStringList titles;
    const auto note = [&titles](QWidget *window) {
        titles.append(window->windowTitle());
        window->close();
    };
    ModalDriver modal;
    modal.handle(note);
    modal.handle(note);
    widget.addAction();
    widget.editAction();
    QVERIFY(modal.finished());
    QCOMPARE(titles, QStringList({QStringLiteral("plus"), QStringLiteral("change")}));
}

void tst_EditActionsWidget::enablesTheButtonsByTheSelection()
{
    EditActionsWidget widget;
    widget.setActions(actions({"a", "b", "c"}));
    auto *list = child<QListWidget>(&widget, "listWidget");
    const auto enabled = [&widget] {
        QStringList names;
        for (const QPushButton *button : widget.findChildren<QPushButton *>()) {
            if (button->isEnabled())
                names.append(button->text());
        }
        return names.join(QLatin1Char(' '));
    };
    list->setCurrentRow(0);
    QCOMPARE(enabled(), QStringLiteral("Add... Edit... Delete Down"));
    list->setCurrentRow(2);
    QCOMPARE(enabled(), QStringLiteral("Add... Edit... Delete Up"));
    list->setSelectionMode(QAbstractItemView::MultiSelection);
    list->selectAll();
    QCOMPARE(enabled(), QStringLiteral("Add... Delete"));
}

void tst_EditActionsWidget::keepsTheButtonsRightWhenActionsComeAndGo()
{
    EditActionsWidget widget;
    widget.setActions(actions({"a"}));
    child<QListWidget>(&widget, "listWidget")->setCurrentRow(0);
    auto *down = child<QPushButton>(&widget, "downButton");
    QVERIFY(!down->isEnabled());
    ModalDriver modal;
    modal.handle([](QWidget *window) {
        retype(child<QLineEdit>(window, "nameEdit"), QStringLiteral("New"));
        retype(child<PathEdit>(window, "execEdit")->findChild<QLineEdit *>(), QStringLiteral("/bin/true"));
        click(okButton(window));
    });
    widget.addAction();
    QVERIFY(modal.finished());
    // The new one is selected.
    QVERIFY(!down->isEnabled());
    QVERIFY(child<QPushButton>(&widget, "upButton")->isEnabled());

    widget.setActions(actions({"b", "c"}));
    for (const QPushButton *button : widget.findChildren<QPushButton *>())
        QCOMPARE(button->isEnabled(), button->objectName() == QLatin1String("addButton"));
}

void tst_EditActionsWidget::deletesAndMoves()
{
    EditActionsWidget widget;
    widget.setActions(actions({"a", "b", "c"}));
    auto *list = child<QListWidget>(&widget, "listWidget");
    QSignalSpy changed(&widget, &EditActionsWidget::changed);
    list->setCurrentRow(0);
    click(child<QPushButton>(&widget, "downButton"));
    QCOMPARE(ids(widget.actions()).join(QString()), QStringLiteral("bac"));
    QCOMPARE(changed.count(), 1);
    click(child<QPushButton>(&widget, "upButton"));
    QCOMPARE(ids(widget.actions()).join(QString()), QStringLiteral("abc"));
    QCOMPARE(changed.count(), 2);
    QCOMPARE(widget.actions().at(0).getName(), QStringLiteral("Name of a"));
    click(child<QPushButton>(&widget, "deleteButton"));
    QCOMPARE(ids(widget.actions()).join(QString()), QStringLiteral("bc"));
    QCOMPARE(changed.count(), 3);
}

void tst_EditActionsWidget::survivesItsDeletionBehindTheDialog()
{
    QPointer<EditActionsWidget> widget(new EditActionsWidget);
    ModalDriver modal;
    modal.handle([&widget](QWidget *) { delete widget; });
    widget->addAction();
    QVERIFY(modal.finished());
    QVERIFY(!widget);
}

VEL_TEST_MAIN(tst_EditActionsWidget)

#include "tst_EditActionsWidget.moc"
