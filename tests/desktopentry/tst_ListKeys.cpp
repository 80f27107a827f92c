// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ActionSamples.h"
#include "FormDriving.h"
#include "TestCase.h"
#include "XDoTool.h"

#include <desktopentry/ActionListEdit.h>
#include <desktopentry/EditActionsDialog.h>
#include <desktopentry/EditStringsDialog.h>
#include <desktopentry/StringListEdit.h>

#include <QListWidget>
#include <QSignalSpy>
#include <QVBoxLayout>

using namespace FormDriving;
using namespace VelUI;

namespace {

QListWidget *listOf(const QWidget *dialog)
{
    return dialog->findChild<QListWidget *>();
}

// Asks for the keyboard again when another window has just closed: the window manager may not have
// given it back.
void activate(QWidget *window)
{
    QTRY_VERIFY_WITH_TIMEOUT((window->activateWindow(), QTest::qWaitForWindowActive(window, 1000)), 20000);
}

void showActive(QWidget *window)
{
    window->show();
    activate(window);
}

// The text that \a dialog tells, null when it tells nothing.
QString told(const QWidget *dialog)
{
    auto *label = dialog->findChild<QLabel *>(QStringLiteral("messageLabel"));
    return label && label->isVisible() ? label->text() : QString();
}

} // namespace

/// What keys and clicks do in the lists of an entry and in the lines that show them.
class tst_ListKeys : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void deletesByTheDeleteKey();
    void deletesNothingWithoutASelection();
    void editsByAKey_data();
    void editsByAKey();
    void acceptsByReturnWithoutASelection();
    void editsByADoubleClick();
    void editsAnAction();
    void selectsAndShowsWhatWasAdded();
    void selectsAndShowsAnActionThatWasAdded();
    void tellsOfASemicolonInAnItem();
    void tellsOfASemicolonThatIsThere();
    void tellsOfIdsBeforeOkTakesThem_data();
    void tellsOfIdsBeforeOkTakesThem();
    void takesAnOddIdWhenTheUserWantsIt();
    void takesOddIdsThatWereThere();
    void proposesAnotherIdForASecondNewAction();
    void opensTheListOfALineByAKey_data();
    void opensTheListOfALineByAKey();
    void opensNoListForOtherKeys_data();
    void opensNoListForOtherKeys();
    void opensNoListOfAReadOnlyLine_data();
    void opensNoListOfAReadOnlyLine();
    void looksReadOnly();
};

void tst_ListKeys::deletesByTheDeleteKey()
{
    EditStringsDialog dialog({QStringLiteral("a"), QStringLiteral("b"), QStringLiteral("c")});
    showActive(&dialog);
    listOf(&dialog)->setFocus();
    listOf(&dialog)->setCurrentRow(1);
    XDoTool::press(QStringLiteral("Delete"));
    QTRY_COMPARE_WITH_TIMEOUT(dialog.strings(), QStringList({QStringLiteral("a"), QStringLiteral("c")}),
                              20000);
    QVERIFY(okButton(&dialog)->isEnabled());
    // Again and again.
    XDoTool::press(QStringLiteral("Delete Delete"));
    QTRY_COMPARE_WITH_TIMEOUT(dialog.strings(), QStringList(), 20000);
}

void tst_ListKeys::deletesNothingWithoutASelection()
{
    EditStringsDialog dialog({QStringLiteral("a"), QStringLiteral("b")});
    showActive(&dialog);
    listOf(&dialog)->setFocus();
    listOf(&dialog)->clearSelection();
    XDoTool::press(QStringLiteral("Delete"));
    XDoTool::press(QStringLiteral("Down")); // has come through, so the first has, too
    QTRY_VERIFY_WITH_TIMEOUT(!listOf(&dialog)->selectedItems().isEmpty(), 20000);
    QCOMPARE(dialog.strings().size(), 2);
    QVERIFY(!okButton(&dialog)->isEnabled());
}

void tst_ListKeys::editsByAKey_data()
{
    QTest::addColumn<QString>("key");
    for (const char *key : {"Return", "KP_Enter", "F2"})
        QTest::newRow(key) << QString::fromLatin1(key);
}

void tst_ListKeys::editsByAKey()
{
    QFETCH(QString, key);
    EditStringsDialog dialog({QStringLiteral("a"), QStringLiteral("b")});
    dialog.setChanged(true);
    showActive(&dialog);
    listOf(&dialog)->setFocus();
    listOf(&dialog)->setCurrentRow(1);
    ModalDriver modal;
    Prompt prompt;
    answerPrompt(modal, QStringLiteral("x"), &prompt);
    XDoTool::press(key);
    QTRY_COMPARE_WITH_TIMEOUT(dialog.strings(), QStringList({QStringLiteral("a"), QStringLiteral("x")}),
                              20000);
    QVERIFY(modal.finished());
    QCOMPARE(prompt.text, QStringLiteral("b"));
    QVERIFY(dialog.isVisible());
}

void tst_ListKeys::acceptsByReturnWithoutASelection()
{
    EditStringsDialog dialog({QStringLiteral("a")});
    dialog.setChanged(true);
    showActive(&dialog);
    listOf(&dialog)->setFocus();
    listOf(&dialog)->clearSelection();
    XDoTool::press(QStringLiteral("Return"));
    QTRY_VERIFY_WITH_TIMEOUT(!dialog.isVisible(), 20000);
    QCOMPARE(dialog.result(), int(QDialog::Accepted));
}

void tst_ListKeys::editsByADoubleClick()
{
    EditStringsDialog dialog({QStringLiteral("a"), QStringLiteral("b")});
    showActive(&dialog);
    ModalDriver modal;
    answerPrompt(modal, QStringLiteral("x"));
    QListWidget *list = listOf(&dialog);
    const QPoint place = list->visualItemRect(list->item(0)).center();
    XDoTool::run(QStringLiteral("mousemove %1 sleep 0.1 click --repeat 2 --delay 50 1")
                     .arg(XDoTool::at(list->viewport(), place)));
    QTRY_COMPARE_WITH_TIMEOUT(dialog.strings(), QStringList({QStringLiteral("x"), QStringLiteral("b")}),
                              20000);
    QVERIFY(modal.finished());
    // The list is not left in the middle of a click.
    list->setCurrentRow(1);
    XDoTool::click(list->viewport(), place);
    QTRY_COMPARE_WITH_TIMEOUT(list->currentRow(), 0, 20000);
}

void tst_ListKeys::editsAnAction()
{
    EditActionsDialog dialog(ActionSamples::actions({"a", "b"}));
    showActive(&dialog);
    listOf(&dialog)->setFocus();
    listOf(&dialog)->setCurrentRow(1);
    ModalDriver modal;
    modal.handle([](QWidget *window) {
        activate(window);
        QCOMPARE(child<QLineEdit>(window, "idEdit")->text(), QStringLiteral("b"));
        window->close();
    });
    XDoTool::press(QStringLiteral("Return"));
    QTRY_VERIFY_WITH_TIMEOUT(modal.finished(), 20000);
    activate(&dialog);
    XDoTool::press(QStringLiteral("Delete"));
    QTRY_COMPARE_WITH_TIMEOUT(dialog.actions().size(), 1, 20000);
}

void tst_ListKeys::selectsAndShowsWhatWasAdded()
{
    QStringList strings;
    for (int i = 0; i < 200; ++i)
        strings.append(QString::number(i));
    EditStringsDialog dialog(strings);
    showActive(&dialog);
    ModalDriver modal;
    answerPrompt(modal, QStringLiteral("new"));
    XDoTool::click(child<QPushButton>(&dialog, "addButton"));
    QTRY_COMPARE_WITH_TIMEOUT(dialog.strings().size(), 201, 20000);
    QListWidget *list = listOf(&dialog);
    QCOMPARE(list->currentRow(), 200);
    QCOMPARE(list->selectedItems(), QList<QListWidgetItem *>{list->item(200)});
    QTRY_VERIFY_WITH_TIMEOUT(list->viewport()->rect().contains(list->visualItemRect(list->item(200))), 20000);
    QVERIFY(child<QPushButton>(&dialog, "upButton")->isEnabled());
}

void tst_ListKeys::selectsAndShowsAnActionThatWasAdded()
{
    EditActionsDialog dialog(ActionSamples::actions({"a", "b"}));
    showActive(&dialog);
    ModalDriver modal;
    modal.handle([](QWidget *window) {
        activate(window);
        QTest::keyClicks(child<QLineEdit>(window, "nameEdit"), QStringLiteral("n"));
        QTest::keyClicks(child<QWidget>(window, "execEdit")->findChild<QLineEdit *>(), QStringLiteral("e"));
        click(okButton(window));
    });
    XDoTool::click(child<QPushButton>(&dialog, "addButton"));
    QTRY_COMPARE_WITH_TIMEOUT(dialog.actions().size(), 3, 20000);
    QCOMPARE(listOf(&dialog)->currentRow(), 2);
    QVERIFY(listOf(&dialog)->item(2)->isSelected());
    QCOMPARE(told(&dialog), QString());
}

void tst_ListKeys::tellsOfASemicolonInAnItem()
{
    EditStringsDialog dialog({QStringLiteral("a"), QStringLiteral("z")});
    showActive(&dialog);
    QCOMPARE(told(&dialog), QString());
    listOf(&dialog)->setCurrentRow(0);
    ModalDriver modal;
    answerPrompt(modal, QStringLiteral("b; c;"));
    XDoTool::click(child<QPushButton>(&dialog, "editButton"));
    QTRY_COMPARE_WITH_TIMEOUT(
        told(&dialog),
        QStringLiteral("The \";\" in \"b; c;\" does not separate items, it becomes part of one item."),
        20000);
    auto *repair = child<QPushButton>(&dialog, "repairButton");
    QCOMPARE(repair->text(), QStringLiteral("Make 2 item(s) of it"));
    activate(&dialog);
    XDoTool::click(repair);
    QTRY_COMPARE_WITH_TIMEOUT(told(&dialog), QString(), 20000);
    QCOMPARE(dialog.strings(), QStringList({QStringLiteral("b"), QStringLiteral("c"), QStringLiteral("z")}));
    QCOMPARE(listOf(&dialog)->currentRow(), 0);
    QVERIFY(listOf(&dialog)->hasFocus());
}

void tst_ListKeys::tellsOfASemicolonThatIsThere()
{
    EditStringsDialog dialog({QStringLiteral("a"), QStringLiteral(";")});
    showActive(&dialog);
    QVERIFY(!told(&dialog).isEmpty());
    QVERIFY(!child<QPushButton>(&dialog, "repairButton")->isVisible());
    QVERIFY(!okButton(&dialog)->isEnabled());
    listOf(&dialog)->setFocus();
    listOf(&dialog)->setCurrentRow(1);
    XDoTool::press(QStringLiteral("Delete"));
    QTRY_COMPARE_WITH_TIMEOUT(told(&dialog), QString(), 20000);
}

void tst_ListKeys::tellsOfIdsBeforeOkTakesThem_data()
{
    QTest::addColumn<QString>("id");
    QTest::addColumn<QString>("said");
    QTest::addColumn<QString>("proposal");
    QTest::newRow("equal") << QStringLiteral(
        "a") << QStringLiteral("Two actions have the id \"a\". The second one can have \"a-2\".")
                           << QStringLiteral("a-2");
    QTest::newRow("impossible") << QStringLiteral("b]")
                                << QStringLiteral("No entry can hold the id \"b]\". It can be \"b\".")
                                << QStringLiteral("b");
    QTest::newRow("odd") << QStringLiteral("new window")
                         << QStringLiteral("The id \"new window\" should have only A to Z, a to z, 0 to 9 "
                                           "and \"-\" in it, as \"new-window\" has.")
                         << QStringLiteral("new-window");
}

void tst_ListKeys::tellsOfIdsBeforeOkTakesThem()
{
    QFETCH(QString, id);
    QFETCH(QString, said);
    QFETCH(QString, proposal);
    EditActionsDialog dialog(ActionSamples::actions({"a", "x"}));
    showActive(&dialog);
    listOf(&dialog)->setCurrentRow(1);
    ModalDriver modal;
    modal.handle([id](QWidget *window) {
        activate(window);
        retype(child<QLineEdit>(window, "idEdit"), id);
        click(okButton(window));
    });
    XDoTool::click(child<QPushButton>(&dialog, "editButton"));
    QTRY_COMPARE_WITH_TIMEOUT(told(&dialog), said, 20000);
    // The item keeps its text until the list is filled again.
    QCOMPARE(listOf(&dialog)->item(1)->text(), QStringLiteral("x"));

    auto *repair = child<QPushButton>(&dialog, "repairButton");
    activate(&dialog);
    XDoTool::click(okButton(&dialog));
    QTRY_VERIFY_WITH_TIMEOUT(repair->hasFocus(), 20000);
    QVERIFY(dialog.isVisible());
    QCOMPARE(repair->text(), QStringLiteral("Use \"%1\"").arg(proposal));
    XDoTool::click(repair);
    QTRY_COMPARE_WITH_TIMEOUT(told(&dialog), QString(), 20000);
    QCOMPARE(ActionSamples::ids(dialog.actions()), QStringList({QStringLiteral("a"), proposal}));
    QCOMPARE(dialog.actions().at(1).getExec(), QStringLiteral("run-x"));
    QCOMPARE(listOf(&dialog)->item(1)->text(), proposal);
    XDoTool::click(okButton(&dialog));
    QTRY_VERIFY_WITH_TIMEOUT(!dialog.isVisible(), 20000);
    QCOMPARE(dialog.result(), int(QDialog::Accepted));
}

void tst_ListKeys::takesAnOddIdWhenTheUserWantsIt()
{
    EditActionsDialog dialog(ActionSamples::actions({"a", "b_c"}));
    showActive(&dialog);
    QVERIFY(!told(&dialog).isEmpty()); // of what is there
    listOf(&dialog)->setCurrentRow(0);
    ModalDriver modal;
    modal.handle([](QWidget *window) {
        activate(window);
        retype(child<QLineEdit>(window, "idEdit"), QStringLiteral("a_b"));
        click(okButton(window));
    });
    XDoTool::click(child<QPushButton>(&dialog, "editButton"));
    auto *repair = child<QPushButton>(&dialog, "repairButton");
    QTRY_COMPARE_WITH_TIMEOUT(repair->text(), QStringLiteral("Use the proposed ids"), 20000);
    activate(&dialog);
    XDoTool::click(okButton(&dialog));
    QTRY_VERIFY_WITH_TIMEOUT(repair->hasFocus(), 20000);
    QVERIFY(dialog.isVisible());
    XDoTool::click(okButton(&dialog));
    QTRY_VERIFY_WITH_TIMEOUT(!dialog.isVisible(), 20000);
    QCOMPARE(ActionSamples::ids(dialog.actions()),
             QStringList({QStringLiteral("a_b"), QStringLiteral("b_c")}));
}

void tst_ListKeys::takesOddIdsThatWereThere()
{
    EditActionsDialog dialog(ActionSamples::actions({"a_b", "c"}));
    showActive(&dialog);
    listOf(&dialog)->setFocus();
    listOf(&dialog)->setCurrentRow(1);
    XDoTool::press(QStringLiteral("Delete"));
    QTRY_VERIFY_WITH_TIMEOUT(okButton(&dialog)->isEnabled(), 20000);
    XDoTool::click(okButton(&dialog));
    QTRY_VERIFY_WITH_TIMEOUT(!dialog.isVisible(), 20000);
    QCOMPARE(ActionSamples::ids(dialog.actions()), QStringList(QStringLiteral("a_b")));
}

void tst_ListKeys::proposesAnotherIdForASecondNewAction()
{
    EditActionsDialog dialog(ActionSamples::actions({"newAction"}));
    showActive(&dialog);
    ModalDriver modal;
    modal.handle([](QWidget *window) {
        activate(window);
        QCOMPARE(child<QLineEdit>(window, "idEdit")->text(), QStringLiteral("newAction"));
        QTest::keyClicks(child<QLineEdit>(window, "nameEdit"), QStringLiteral("n"));
        QTest::keyClicks(child<QWidget>(window, "execEdit")->findChild<QLineEdit *>(), QStringLiteral("e"));
        click(okButton(window));
    });
    XDoTool::click(child<QPushButton>(&dialog, "addButton"));
    QTRY_VERIFY_WITH_TIMEOUT(!told(&dialog).isEmpty(), 20000);
    activate(&dialog);
    child<QPushButton>(&dialog, "repairButton")->setFocus();
    XDoTool::press(QStringLiteral("Return"));
    QTRY_COMPARE_WITH_TIMEOUT(ActionSamples::ids(dialog.actions()),
                              QStringList({QStringLiteral("newAction"), QStringLiteral("newAction-2")}),
                              20000);
    QVERIFY(listOf(&dialog)->item(1)->isSelected());
}

void tst_ListKeys::opensTheListOfALineByAKey_data()
{
    QTest::addColumn<QString>("keys");
    for (const char *keys : {"Return", "KP_Enter", "F2", "x", "X", "space", "7"})
        QTest::newRow(keys) << QString::fromLatin1(keys);
}

void tst_ListKeys::opensTheListOfALineByAKey()
{
    QFETCH(QString, keys);
    QDialog window; // with a button that Return would press
    StringListEdit strings(&window);
    ActionListEdit actions(&window);
    QDialogButtonBox box(QDialogButtonBox::Ok, &window);
    QVBoxLayout layout(&window);
    for (QWidget *widget :
         {static_cast<QWidget *>(&strings), static_cast<QWidget *>(&actions), static_cast<QWidget *>(&box)})
        layout.addWidget(widget);
    QSignalSpy pressed(&box, &QDialogButtonBox::accepted);
    showActive(&window);
    for (QWidget *field : {static_cast<QWidget *>(&strings), static_cast<QWidget *>(&actions)}) {
        ModalDriver modal;
        QStringList opened;
        modal.handle([&opened](QWidget *dialog) {
            opened.append(dialog->objectName());
            activate(dialog);
            dialog->close();
        });
        activate(&window);
        field->setFocus();
        XDoTool::press(keys);
        QTRY_VERIFY_WITH_TIMEOUT(modal.finished() && !QApplication::activeModalWidget(), 20000);
        QCOMPARE(opened.size(), 1);
        QCOMPARE(opened.first(),
                 field == &strings ? QStringLiteral("EditStringsDialog")
                                   : QStringLiteral("EditActionsDialog"));
    }
    QCOMPARE(pressed.count(), 0);
    QVERIFY(window.isVisible());
}

void tst_ListKeys::opensNoListForOtherKeys_data()
{
    QTest::addColumn<QString>("keys");
    for (const char *keys :
         {"ctrl+c", "ctrl+a", "alt+x", "Home", "Right", "BackSpace", "Delete", "F3", "shift+F2"})
        QTest::newRow(keys) << QString::fromLatin1(keys);
}

void tst_ListKeys::opensNoListForOtherKeys()
{
    QFETCH(QString, keys);
    QWidget window;
    StringListEdit strings(&window);
    strings.setStrings({QStringLiteral("a")});
    QLineEdit other(&window);
    QVBoxLayout layout(&window);
    layout.addWidget(&strings);
    layout.addWidget(&other);
    showActive(&window);
    strings.setFocus();
    ModalDriver modal; // fails the test when a dialog opens
    XDoTool::press(keys);
    XDoTool::press(QStringLiteral("Tab"));
    QTRY_VERIFY_WITH_TIMEOUT(!child<QLineEdit>(&strings, "stringListShow")->hasFocus(), 20000);
    QVERIFY(modal.finished());
    QCOMPARE(strings.strings(), QStringList(QStringLiteral("a")));
}

void tst_ListKeys::opensNoListOfAReadOnlyLine_data()
{
    QTest::addColumn<QString>("keys");
    for (const char *keys : {"F2", "x", "Return"})
        QTest::newRow(keys) << QString::fromLatin1(keys);
}

void tst_ListKeys::opensNoListOfAReadOnlyLine()
{
    QFETCH(QString, keys);
    QWidget window;
    StringListEdit strings(&window);
    QLineEdit other(&window);
    QVBoxLayout layout(&window);
    layout.addWidget(&strings);
    layout.addWidget(&other);
    strings.setReadOnly(true);
    showActive(&window);
    strings.setFocus();
    ModalDriver modal; // fails the test when a dialog opens
    XDoTool::press(keys);
    XDoTool::press(QStringLiteral("Tab"));
    QTRY_VERIFY_WITH_TIMEOUT(other.hasFocus(), 20000);
    QVERIFY(modal.finished());
}

void tst_ListKeys::looksReadOnly()
{
    QWidget window;
    StringListEdit strings(&window);
    ActionListEdit actions(&window);
    for (const char *name : {"stringListShow", "actionListShow"}) {
        auto *line = child<QLineEdit>(&window, name);
        QCOMPARE(line->palette().color(QPalette::Base), window.palette().color(QPalette::Window));
        QPalette dark(Qt::black);
        window.setPalette(dark);
        QTRY_COMPARE_WITH_TIMEOUT(line->palette().color(QPalette::Base), dark.color(QPalette::Window), 20000);
        QCOMPARE(line->palette().color(QPalette::Text), dark.color(QPalette::WindowText));
        window.setPalette(QPalette());
    }
}

VEL_TEST_MAIN(tst_ListKeys)

#include "tst_ListKeys.moc"
