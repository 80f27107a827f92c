// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "AssistedTestCase.h"
#include "QtMajor.h"

#include <QMainWindow>

/// What a person does about a key that clashes while it is recorded. Keys and clicks come from the
/// X server.
class tst_AssistedRecording : public AssistedTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void explainsAClashAndWaits();
    void takesAKeyThatIsOnlyAdvisedAgainst();
    void recordsAnotherKeyOverOneThatClashes();
    void keepsTheKeyThatClashesAtABareModifier();

    void recordsAnotherKeyWhenTheFieldIsEnteredAgain();

    void takesOverAKey_data();
    void takesOverAKey();
    void takesOverAKeyWithoutTheFocus();
    void takesOverFromOneAfterTheOther();
    void takesOverThePrefixOfARecording();
    void resetsBothKeys();

    void goesToTheOtherShortcut_data();
    void goesToTheOtherShortcut();

    void refusesTheKeyWhenTheFieldIsLeft_data();
    void refusesTheKeyWhenTheFieldIsLeft();
    void refusesTheKeyWhenTheBoxIsLeft_data();
    void refusesTheKeyWhenTheBoxIsLeft();
    void refusesAGlobalKey();
    void dropsTheKeyWithCancel_data();
    void dropsTheKeyWithCancel();
    void waitsWhileAnotherWindowIsUsed();

    void takesAKeyAway_data();
    void takesAKeyAway();
    void takesAKeyAwayInsteadOfOneThatClashes();
    void movesTheFocusIntoTheField_data();
    void movesTheFocusIntoTheField();
    void leavesTheFieldByTab();

private:
    // Whether a real key triggers the one action alone, once the dialog is closed.
    void checkThatFires(const QString &key, const QAction *fired);
};

void tst_AssistedRecording::checkThatFires(const QString &key, const QAction *fired)
{
    QMainWindow window;
    window.addActions({open, save, print, copy, cut});
    window.show();
    window.activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(&window));
    QStringList triggered;
    for (const QAction *action : window.actions())
        connect(action, &QAction::triggered, &window, [&, action] { triggered.append(action->text()); });
    XDoTool::press(key);
    QTRY_COMPARE(triggered, fired ? QStringList{fired->text()} : QStringList());
}

void tst_AssistedRecording::explainsAClashAndWaits()
{
    const ModalDriver modal;
    recordClash("open", str("F2"));
    QCOMPARE(texts(), QStringList{sameKey("F2", "Text of save")});
    QVERIFY(lineButton(0, "Go to"));
    QVERIFY(lineButton(0, "Take over"));
    QVERIFY(isChanged());
    QVERIFY(keysStay());
    QCOMPARE(keyWidget()->keySequence(), f2);
    QVERIFY(keyWidget()->hasFocus());
    QCOMPARE(texts(), QStringList{sameKey("F2", "Text of save")});
    QCOMPARE(pendingKey("open"), f1);
    QVERIFY(isChanged());
    QVERIFY(modal.finished());
}

void tst_AssistedRecording::takesAKeyThatIsOnlyAdvisedAgainst()
{
    const ModalDriver modal;
    // Ctrl+K deletes in texts; the longer key is that of "cut".
    recordClash("open", str("ctrl+k"));
    const QStringList advice = texts();
    QCOMPARE(advice.size(), 2);
    QCOMPARE(advice.constFirst(),
             str("Shortcut 'Ctrl+K, Ctrl+C' of action 'Text of cut' begins with 'Ctrl+K'."));
    QTRY_COMPARE(pendingKey("open"), QKeySequence(Qt::CTRL | Qt::Key_K));
    QCOMPARE(texts(), advice);
    recordClash("open", str("j"));
    QTRY_COMPARE(pendingKey("open"), QKeySequence(Qt::Key_J));
    QCOMPARE(texts(), QStringList{str("With 'J' as a shortcut this key cannot be typed into texts.")});
    QVERIFY(lines().constFirst()->findChildren<QPushButton *>().isEmpty());
    QVERIFY(modal.finished());
}

void tst_AssistedRecording::recordsAnotherKeyOverOneThatClashes()
{
    recordClash("open", str("F2"));
    QVERIFY(keysStay());
    XDoTool::press(str("ctrl+j"));
    QTRY_COMPARE(pendingKey("open"), ctrlJ);
    QCOMPARE(keyWidget()->keySequence(), ctrlJ);
    QTRY_VERIFY(lines().isEmpty());
    QCOMPARE(pendingKey("save"), f2);
}

void tst_AssistedRecording::keepsTheKeyThatClashesAtABareModifier()
{
    const ModalDriver modal;
    recordClash("open", str("F2"));
    QVERIFY(keysStay());
    XDoTool::press(str("ctrl"));
    QVERIFY(keysStay());
    QCOMPARE(keyWidget()->keySequence(), f2);
    QCOMPARE(lines().size(), 1);
    QCOMPARE(pendingKey("open"), f1);
    QVERIFY(modal.finished());
    XDoTool::press(str("ctrl+shift+j"));
    const QKeySequence ctrlShiftJ(Qt::CTRL | Qt::SHIFT | Qt::Key_J);
    QTRY_COMPARE(pendingKey("open"), ctrlShiftJ);
}

void tst_AssistedRecording::recordsAnotherKeyWhenTheFieldIsEnteredAgain()
{
    recordClash("open", str("F2"));
    // At once, while the field would wait for another chord.
    XDoTool::run(str("key Tab key shift+Tab key ctrl+j"));
    QTRY_COMPARE(pendingKey("open"), ctrlJ);
}

void tst_AssistedRecording::takesOverAKey_data()
{
    QTest::addColumn<QString>("how");
    QTest::addColumn<bool>("atOnce");
    for (const bool atOnce : {false, true}) {
        for (const char *how : {"mouse", "space", "Return"})
            QTest::addRow("%s%s", how, atOnce ? ", at once" : "") << str(how) << atOnce;
    }
}

void tst_AssistedRecording::takesOverAKey()
{
    QFETCH(QString, how);
    QFETCH(bool, atOnce);
    const ModalDriver modal;
    recordClash("open", str("F2"));
    if (!atOnce)
        QVERIFY(keysStay());
    QPushButton *takeOver = lineButton(0, "Take over");
    if (how == str("mouse")) {
        // Held for a while, as hands do.
        XDoTool::run(str("mousemove %1 sleep 0.1 mousedown 1 sleep 0.3 mouseup 1")
                         .arg(XDoTool::at(takeOver, takeOver->rect().center())));
    } else {
        XDoTool::press(str("Tab"));
        QTRY_VERIFY(lineButton(0, "Go to")->hasFocus());
        XDoTool::press(str("Tab"));
        QTRY_VERIFY(takeOver->hasFocus());
        XDoTool::press(how);
    }
    QTRY_COMPARE(pendingKey("open"), f2);
    QCOMPARE(pendingKey("save"), QKeySequence());
    QTRY_VERIFY(lines().isEmpty());
    QCOMPARE(keyWidget()->keySequence(), f2);
    QVERIFY(tree()->hasFocus());
    QCOMPARE(open->shortcut(), f1);
    XDoTool::click(button(QDialogButtonBox::Ok));
    QTRY_VERIFY(!m_dialog->isVisible());
    QVERIFY(modal.finished());
    checkThatFires(str("F2"), open);
    checkThatFires(str("F1"), nullptr);
}

// As a screen reader presses a button.
void tst_AssistedRecording::takesOverAKeyWithoutTheFocus()
{
    recordClash("open", str("F2"));
    lineButton(0, "Take over")->click();
    QCOMPARE(pendingKey("open"), f2);
    QCOMPARE(pendingKey("save"), QKeySequence());
    QVERIFY(keysStay());
    recordClash("print", str("F2"));
    lineButton(0, "Go to")->click();
    QCOMPARE(tree()->currentIndex(), row("open"));
    QVERIFY(keysStay());
    QCOMPARE(pendingKey("print"), QKeySequence());
}

void tst_AssistedRecording::takesOverFromOneAfterTheOther()
{
    m_model->setKeySequence(row("copy"), f2);
    const ModalDriver modal;
    recordClash("open", str("F2"));
    QCOMPARE(texts(), (QStringList{sameKey("F2", "Text of save"), sameKey("F2", "Text of copy")}));
    XDoTool::click(lineButton(0, "Take over"));
    QTRY_COMPARE(texts(), QStringList{sameKey("F2", "Text of copy")});
    QCOMPARE(pendingKey("save"), QKeySequence());
    QCOMPARE(pendingKey("open"), f1);
    QCOMPARE(keyWidget()->keySequence(), f2);
    QVERIFY(keysStay());
    XDoTool::click(lineButton(0, "Take over"));
    QTRY_COMPARE(pendingKey("open"), f2);
    QCOMPARE(pendingKey("copy"), QKeySequence());
    QVERIFY(modal.finished());
}

void tst_AssistedRecording::takesOverThePrefixOfARecording()
{
    m_model->setKeySequence(row("cut"), VelTest::keySequence(Qt::CTRL | Qt::Key_J, Qt::CTRL | Qt::Key_D));
    recordClash("open", str("ctrl+j"));
    XDoTool::click(lineButton(0, "Take over"));
    QTRY_COMPARE(pendingKey("cut"), QKeySequence());
    QCOMPARE(pendingKey("open"), ctrlJ);
    QTRY_VERIFY(lines().isEmpty());
    QVERIFY(keysStay());
}

void tst_AssistedRecording::resetsBothKeys()
{
    recordClash("open", str("F2"));
    XDoTool::click(lineButton(0, "Take over"));
    QTRY_COMPARE(pendingKey("open"), f2);
    QVERIFY(button(QDialogButtonBox::RestoreDefaults)->isEnabled());
    XDoTool::click(button(QDialogButtonBox::Reset));
    QTRY_COMPARE(pendingKey("open"), f1);
    QCOMPARE(pendingKey("save"), f2);
    QVERIFY(!isChanged());
}

void tst_AssistedRecording::goesToTheOtherShortcut_data()
{
    QTest::addColumn<bool>("byMouse");
    QTest::addColumn<bool>("changedBefore");
    QTest::newRow("mouse") << true << false;
    QTest::newRow("keyboard") << false << false;
    QTest::newRow("mouse, changed before") << true << true;
}

void tst_AssistedRecording::goesToTheOtherShortcut()
{
    QFETCH(bool, byMouse);
    QFETCH(bool, changedBefore);
    if (changedBefore) {
        m_model->setKeySequence(row("print"), f9);
        m_dialog->setChanged(true);
    }
    const ModalDriver modal;
    recordClash("open", str("F2"));
    if (byMouse) {
        XDoTool::click(lineButton(0, "Go to"));
    } else {
        XDoTool::press(str("Tab"));
        QTRY_VERIFY(lineButton(0, "Go to")->hasFocus());
        XDoTool::press(str("space"));
    }
    QTRY_COMPARE(tree()->currentIndex(), row("save"));
    QTRY_VERIFY(lines().isEmpty());
    QVERIFY(tree()->hasFocus());
    QVERIFY(keysStay());
    QCOMPARE(pendingKey("open"), f1);
    QCOMPARE(pendingKey("save"), f2);
    QCOMPARE(isChanged(), changedBefore);
    QVERIFY(modal.finished());
}

void tst_AssistedRecording::refusesTheKeyWhenTheFieldIsLeft_data()
{
    QTest::addColumn<QString>("how");
    QTest::addColumn<bool>("atOnce");
    for (const bool atOnce : {false, true}) {
        for (const char *how : {"tree", "Shift+Tab", "Ok", "Ok by click()", "close", "Reset"})
            QTest::addRow("%s%s", how, atOnce ? ", at once" : "") << str(how) << atOnce;
    }
}

void tst_AssistedRecording::refusesTheKeyWhenTheFieldIsLeft()
{
    QFETCH(QString, how);
    QFETCH(bool, atOnce);
    recordClash("open", str("F2"));
    if (!atOnce)
        QVERIFY(keysStay());
    ModalDriver modal;
    modal.answer(localConflict("F2", "Text of save"), QMessageBox::Ok);
    if (how == str("tree"))
        XDoTool::click(tree()->viewport(), tree()->visualRect(row("copy")).center());
    else if (how == str("Shift+Tab"))
        XDoTool::press(str("shift+Tab"));
    else if (how == str("Ok"))
        XDoTool::click(button(QDialogButtonBox::Ok));
    else if (how == str("Ok by click()"))
        button(QDialogButtonBox::Ok)->click();
    else if (how == str("close"))
        QVERIFY(!m_dialog->close());
    else
        XDoTool::click(button(QDialogButtonBox::Reset));
    QTRY_VERIFY(modal.finished() && !QApplication::activeModalWidget());
    QVERIFY(keysStay());
    QVERIFY(m_dialog->isVisible());
    QCOMPARE(pendingKey("open"), f1);
    QCOMPARE(pendingKey("save"), f2);
    QVERIFY(!isChanged());
    QVERIFY(keyWidget()->keySequence() != f2);
    QTRY_VERIFY(lines().isEmpty());
}

void tst_AssistedRecording::refusesTheKeyWhenTheBoxIsLeft_data()
{
    QTest::addColumn<QString>("how");
    for (const char *how : {"tree", "Tab", "Ok", "Ok by click()", "close"})
        QTest::newRow(how) << str(how);
}

void tst_AssistedRecording::refusesTheKeyWhenTheBoxIsLeft()
{
    QFETCH(QString, how);
    recordClash("open", str("F2"));
    XDoTool::press(str("Tab"));
    QTRY_VERIFY(lineButton(0, "Go to")->hasFocus());
    QVERIFY(keysStay());
    QCOMPARE(keyWidget()->keySequence(), f2);
    ModalDriver modal;
    modal.answer(localConflict("F2", "Text of save"), QMessageBox::Ok);
    if (how == str("tree")) {
        XDoTool::click(tree()->viewport(), tree()->visualRect(row("copy")).center());
    } else if (how == str("Tab")) {
        XDoTool::press(str("Tab"));
        XDoTool::press(str("Tab"));
        QTRY_VERIFY(noneButton()->hasFocus());
        XDoTool::press(str("Tab"));
    } else if (how == str("Ok")) {
        XDoTool::click(button(QDialogButtonBox::Ok));
    } else if (how == str("Ok by click()")) {
        button(QDialogButtonBox::Ok)->click();
    } else {
        QVERIFY(!m_dialog->close());
    }
    QTRY_VERIFY(modal.finished() && !QApplication::activeModalWidget());
    QVERIFY(keysStay());
    QVERIFY(m_dialog->isVisible());
    QCOMPARE(pendingKey("open"), f1);
    QVERIFY(!isChanged());
    QTRY_VERIFY(lines().isEmpty());
}

void tst_AssistedRecording::refusesAGlobalKey()
{
    write(str("keyshortcutrc"), "[ShortCutKeys]\nF2=VELWM_MENU\n");
    recordClash("open", str("F2"));
    QCOMPARE(texts(),
             (QStringList{sameKey("F2", "Text of save"),
                          str("Shortcut 'F2' is already used for global action 'VELWM_MENU'.")}));
    // That would not help.
    QVERIFY(!lineButton(0, "Take over"));
    QVERIFY(lineButton(0, "Go to"));
    QVERIFY(!lineButton(1, "Go to"));
    QVERIFY(keysStay());
    ModalDriver modal;
    modal.answer(globalConflict("F2", "VELWM_MENU"), QMessageBox::Ok);
    XDoTool::click(tree()->viewport(), tree()->visualRect(row("copy")).center());
    QTRY_VERIFY(modal.finished() && !QApplication::activeModalWidget());
    QCOMPARE(pendingKey("open"), f1);
}

void tst_AssistedRecording::dropsTheKeyWithCancel_data()
{
    QTest::addColumn<bool>("fromTheBox");
    QTest::newRow("from the field") << false;
    QTest::newRow("from the box") << true;
}

void tst_AssistedRecording::dropsTheKeyWithCancel()
{
    QFETCH(bool, fromTheBox);
    const ModalDriver modal;
    recordClash("open", str("F2"));
    if (fromTheBox) {
        XDoTool::press(str("Tab"));
        QTRY_VERIFY(lineButton(0, "Go to")->hasFocus());
    }
    XDoTool::click(button(QDialogButtonBox::Cancel));
    QTRY_VERIFY(!m_dialog->isVisible());
    QVERIFY(keysStay());
    QVERIFY(modal.finished());
    QCOMPARE(pendingKey("open"), f1);
}

void tst_AssistedRecording::waitsWhileAnotherWindowIsUsed()
{
    const ModalDriver modal;
    recordClash("open", str("F2"));
    QWidget window;
    window.show();
    window.activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(&window));
    QVERIFY(keysStay());
    m_dialog->activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(m_dialog.get()));
    QCOMPARE(keyWidget()->keySequence(), f2);
    QCOMPARE(lines().size(), 1);
    QVERIFY(modal.finished());
    XDoTool::click(lineButton(0, "Take over"));
    QTRY_COMPARE(pendingKey("open"), f2);
}

void tst_AssistedRecording::takesAKeyAway_data()
{
    QTest::addColumn<bool>("byMouse");
    QTest::newRow("mouse") << true;
    QTest::newRow("keyboard") << false;
}

void tst_AssistedRecording::takesAKeyAway()
{
    QFETCH(bool, byMouse);
    const ModalDriver modal;
    record("open");
    if (byMouse) {
        XDoTool::click(noneButton());
    } else {
        XDoTool::press(str("Tab"));
        QTRY_VERIFY(noneButton()->hasFocus());
        XDoTool::press(str("space"));
    }
    QTRY_VERIFY(pendingKey("open").isEmpty());
    QVERIFY(isChanged());
    QVERIFY(customButton()->isChecked());
    QVERIFY(keyWidget()->keySequence().isEmpty());
    QCOMPARE(open->shortcut(), f1);
    XDoTool::click(button(QDialogButtonBox::Ok));
    QTRY_VERIFY(!m_dialog->isVisible());
    QVERIFY(open->shortcut().isEmpty());
    QVERIFY(modal.finished());
}

void tst_AssistedRecording::takesAKeyAwayInsteadOfOneThatClashes()
{
    const ModalDriver modal;
    recordClash("open", str("F2"));
    XDoTool::click(noneButton());
    QTRY_VERIFY(pendingKey("open").isEmpty());
    QTRY_VERIFY(lines().isEmpty());
    QCOMPARE(pendingKey("save"), f2);
    QVERIFY(keysStay());
    QVERIFY(modal.finished());

    // One that has no key stays as it is.
    m_dialog->setChanged(false);
    select("print");
    XDoTool::click(noneButton());
    QVERIFY(keysStay());
    QVERIFY(!isChanged());
}

void tst_AssistedRecording::movesTheFocusIntoTheField_data()
{
    QTest::addColumn<QString>("how");
    for (const char *how : {"mouse", "Down", "space", "mouse, chosen already"})
        QTest::newRow(how) << str(how);
}

void tst_AssistedRecording::movesTheFocusIntoTheField()
{
    QFETCH(QString, how);
    select("open");
    QVERIFY(!keyWidget()->hasFocus());
    if (how.endsWith(str("already")))
        customButton()->setChecked(true);
    QVERIFY(!keyWidget()->hasFocus());
    if (how.startsWith(str("mouse"))) {
        XDoTool::click(customButton());
    } else if (how == str("Down")) {
        defaultButton()->setFocus();
        XDoTool::press(how);
    } else {
        customButton()->setFocus();
        XDoTool::press(how);
    }
    QTRY_VERIFY(keyWidget()->hasFocus());
    QVERIFY(customButton()->isChecked());
    QVERIFY(keysStay());
    QCOMPARE(pendingKey("open"), f1);
    // The row alone does not.
    m_model->setKeySequence(row("save"), f9);
    tree()->setFocus();
    select("save");
    QVERIFY(customButton()->isChecked());
    QVERIFY(tree()->hasFocus());
}

void tst_AssistedRecording::leavesTheFieldByTab()
{
    QVERIFY(keyWidget()->toolTip().contains(str("Tab leaves the field")));
    QVERIFY(keyWidget()->accessibleDescription().contains(str("Tab leaves the field")));
    record("open");
    XDoTool::press(str("Tab"));
    QTRY_VERIFY(noneButton()->hasFocus());
    XDoTool::press(str("Tab"));
    QTRY_VERIFY(child<QDialogButtonBox>("buttonBox")->isAncestorOf(m_dialog->focusWidget()));
    XDoTool::press(str("shift+Tab"));
    QTRY_VERIFY(noneButton()->hasFocus());
    XDoTool::press(str("shift+Tab"));
    QTRY_VERIFY(keyWidget()->hasFocus());
    QCOMPARE(pendingKey("open"), f1);
}

VEL_TEST_MAIN(tst_AssistedRecording)

#include "tst_AssistedRecording.moc"
