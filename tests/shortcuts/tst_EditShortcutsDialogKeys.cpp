// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// Keys recorded by pressing them, in a window that has the focus.

#include "DialogTestCase.h"
#include "QtMajor.h"

#include <QProcess>
#include <QSignalSpy>

class tst_EditShortcutsDialogKeys : public DialogTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void init();

    void recordsAKey();
    void recordsSeveralChords();
    void recordsAKeyOverAnother();
    void recordsAKeyOfTheRealKeyboard();
    void keepsTheKeyWhenOnlyAModifierIsPressed();
    void asksNothingWhenARecordingBegins();
    void refusesATakenKeyAfterTheRecording();
    void endsTheRecordingWhenTheFocusLeaves();
    void goesOnRecordingBesideAMenu();
    void ignoresARecordingWhoseRowIsGone_data();
    void ignoresARecordingWhoseRowIsGone();
    void takesAnEmptyKeyAfterARecording();
    void takesAnEmptyKeyAfterTheHostChangedTheKey();
    void goesFromFieldToFieldWithTab();
    void leavesTheFieldByTabWithModifiers_data();
    void leavesTheFieldByTabWithModifiers();
    void keepsTheKeyWhenAnEmptyFieldIsLeft_data();
    void keepsTheKeyWhenAnEmptyFieldIsLeft();
    void confirmsWithReturn();

private:
    void record(const char *name);
    void press(int key, Qt::KeyboardModifiers modifiers = Qt::NoModifier);
};

void tst_EditShortcutsDialogKeys::init()
{
    DialogTestCase::init();
    m_dialog->show();
    m_dialog->activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(m_dialog.get()));
}

// Makes the action current and its key editor ready.
void tst_EditShortcutsDialogKeys::record(const char *name)
{
    // A message that was shown for a moment may have taken the keys along.
    m_dialog->activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(m_dialog.get()));
    select(name);
    customButton()->setChecked(true);
    keyWidget()->setFocus();
    QTRY_VERIFY(keyWidget()->hasFocus());
}

void tst_EditShortcutsDialogKeys::press(int key, Qt::KeyboardModifiers modifiers)
{
    QTest::keyClick(keyWidget(), Qt::Key(key), modifiers);
}

void tst_EditShortcutsDialogKeys::recordsAKey()
{
    record("open");
    press(Qt::Key_J, Qt::ControlModifier | Qt::AltModifier);
    QCOMPARE(pendingKey("open"), f1);
    QTRY_COMPARE(pendingKey("open"), QKeySequence(Qt::CTRL | Qt::ALT | Qt::Key_J));
    QVERIFY(isChanged());
    QCOMPARE(keyWidget()->keySequence(), QKeySequence(Qt::CTRL | Qt::ALT | Qt::Key_J));
}

void tst_EditShortcutsDialogKeys::recordsSeveralChords()
{
    record("open");
    press(Qt::Key_K, Qt::ControlModifier);
    press(Qt::Key_D, Qt::ControlModifier);
    press(Qt::Key_E);
    QTRY_COMPARE(pendingKey("open"),
                 VelTest::keySequence(Qt::CTRL | Qt::Key_K, Qt::CTRL | Qt::Key_D, Qt::Key_E));
    QCOMPARE(row("open").siblingAtColumn(1).data().toString(), str("Ctrl+K, Ctrl+D, E"));
}

void tst_EditShortcutsDialogKeys::recordsAKeyOverAnother()
{
    m_model->setKeySequence(row("open"), f9);
    record("open");
    QSignalSpy spy(m_model.get(), &QAbstractItemModel::dataChanged);
    press(Qt::Key_F8);
    QVERIFY(keyWidget()->keySequence() == QKeySequence(Qt::Key_F8));
    QTRY_COMPARE(pendingKey("open"), QKeySequence(Qt::Key_F8));
    QCOMPARE(spy.count(), 1);
}

void tst_EditShortcutsDialogKeys::recordsAKeyOfTheRealKeyboard()
{
    record("save");
    QProcess xdotool;
    xdotool.start(str("xdotool"), {str("key"), str("ctrl+shift+F7")});
    QVERIFY(xdotool.waitForFinished());
    QCOMPARE(xdotool.exitCode(), 0);
    QTRY_COMPARE(pendingKey("save"), QKeySequence(Qt::CTRL | Qt::SHIFT | Qt::Key_F7));
}

void tst_EditShortcutsDialogKeys::keepsTheKeyWhenOnlyAModifierIsPressed()
{
    m_model->setKeySequence(row("open"), f9);
    record("open");
    QSignalSpy spy(keyWidget(), &QKeySequenceEdit::editingFinished);
    press(Qt::Key_Control);
    QVERIFY(spy.wait());
    QCOMPARE(pendingKey("open"), f9);
    QCOMPARE(keyWidget()->keySequence(), f9);
    QVERIFY(keyWidget()->isEnabled());
    QVERIFY(!isChanged());

    // For an action without a default key an empty one would be the default.
    m_model->setKeySequence(row("print"), f9);
    record("print");
    spy.clear();
    press(Qt::Key_Shift);
    QVERIFY(spy.wait());
    QCOMPARE(pendingKey("print"), f9);
    QVERIFY(customButton()->isChecked());
}

void tst_EditShortcutsDialogKeys::asksNothingWhenARecordingBegins()
{
    // "print" has no key, the file an empty one: an empty sequence would clash with both.
    write(str("keyshortcutrc"), "[ShortCutKeys]\nNone+=VELWM_MENU\n");
    m_model->setKeySequence(row("open"), f9);
    record("open");
    ModalDriver modal;
    press(Qt::Key_F8);
    QCOMPARE(pendingKey("open"), f9);
    QTRY_COMPARE(pendingKey("open"), QKeySequence(Qt::Key_F8));
    QVERIFY(modal.finished());
}

void tst_EditShortcutsDialogKeys::refusesATakenKeyAfterTheRecording()
{
    write(str("keyshortcutrc"), "[ShortCutKeys]\nMod4|j=VELWM_RUN\n");
    m_model->setKeySequence(row("open"), f9);
    record("open");
    ModalDriver modal;
    modal.answerWith(localConflict("F2", "Text of save"), [this](QMessageBox *box) {
        // That the message takes the focus is no second reason for one.
        QTRY_VERIFY(!keyWidget()->hasFocus());
        box->button(QMessageBox::Ok)->click();
    });
    press(Qt::Key_F2);
    QTRY_VERIFY(modal.finished() && !QApplication::activeModalWidget());
    QCOMPARE(pendingKey("open"), f9);
    QCOMPARE(keyWidget()->keySequence(), f9);

    modal.answer(globalConflict("Meta+J", "VELWM_RUN"), QMessageBox::Ok);
    press(Qt::Key_J, Qt::MetaModifier);
    QTRY_VERIFY(modal.finished() && !QApplication::activeModalWidget());
    QCOMPARE(pendingKey("open"), f9);

    // The next recording is a whole one.
    press(Qt::Key_F8);
    QTRY_COMPARE(pendingKey("open"), QKeySequence(Qt::Key_F8));
}

void tst_EditShortcutsDialogKeys::endsTheRecordingWhenTheFocusLeaves()
{
    record("open");
    press(Qt::Key_F8);
    tree()->setFocus();
    QCOMPARE(pendingKey("open"), QKeySequence(Qt::Key_F8));

    // A taken key is refused then, and only once.
    record("open");
    ModalDriver modal;
    modal.answer(localConflict("F2", "Text of save"), QMessageBox::Ok);
    press(Qt::Key_F2);
    tree()->setFocus();
    QVERIFY(modal.finished());
    QCOMPARE(pendingKey("open"), QKeySequence(Qt::Key_F8));
    QCOMPARE(keyWidget()->keySequence(), QKeySequence(Qt::Key_F8));

    m_model->setKeySequence(row("save"), f9);
    record("save");
    QTest::keyPress(keyWidget(), Qt::Key_Control);
    tree()->setFocus();
    QCOMPARE(keyWidget()->keySequence(), f9);
    QCOMPARE(pendingKey("save"), f9);
}

void tst_EditShortcutsDialogKeys::goesOnRecordingBesideAMenu()
{
    record("open");
    press(Qt::Key_F2);
    // A message about the taken key would lie below the menu, where no click reaches it.
    ModalDriver modal;
    QFocusEvent menu(QEvent::FocusOut, Qt::PopupFocusReason);
    QCoreApplication::sendEvent(keyWidget(), &menu);
    QVERIFY(!QApplication::activeModalWidget());
    QCOMPARE(keyWidget()->keySequence(), QKeySequence(Qt::Key_F2));
    modal.answer(localConflict("F2", "Text of save"), QMessageBox::Ok);
    QTRY_VERIFY(modal.finished() && !QApplication::activeModalWidget());
}

void tst_EditShortcutsDialogKeys::ignoresARecordingWhoseRowIsGone_data()
{
    QTest::addColumn<int>("key");
    QTest::newRow("free") << int(Qt::Key_F8);
    QTest::newRow("taken") << int(Qt::Key_F2);
}

void tst_EditShortcutsDialogKeys::ignoresARecordingWhoseRowIsGone()
{
    QFETCH(int, key);
    const ModalDriver modal;
    record("open");
    press(key);
    QSignalSpy spy(keyWidget(), &QKeySequenceEdit::editingFinished);
    delete open;
    QTRY_VERIFY(!groupBox()->isEnabled());
    QVERIFY(!spy.wait(1500));
    QVERIFY(modal.finished());
    QVERIFY(!m_model->hasKeySequence(QKeySequence(Qt::Key_F8)));
    QVERIFY(!isChanged());
}

void tst_EditShortcutsDialogKeys::takesAnEmptyKeyAfterARecording()
{
    record("open");
    press(Qt::Key_F8);
    QTRY_COMPARE(pendingKey("open"), QKeySequence(Qt::Key_F8));
    keyWidget()->clear();
    QVERIFY(pendingKey("open").isEmpty());
}

void tst_EditShortcutsDialogKeys::takesAnEmptyKeyAfterTheHostChangedTheKey()
{
    m_model->setKeySequence(row("open"), f9);
    record("open");
    press(Qt::Key_F8);
    m_model->setKeySequence(row("open"), QKeySequence(Qt::Key_F7));
    QCOMPARE(keyWidget()->keySequence(), QKeySequence(Qt::Key_F7));
    keyWidget()->clear();
    QVERIFY(pendingKey("open").isEmpty());
}

void tst_EditShortcutsDialogKeys::goesFromFieldToFieldWithTab()
{
    m_model->setKeySequence(row("open"), f9);
    select("open");
    tree()->setFocus();
    QTest::keyClick(tree(), Qt::Key_Tab);
    QVERIFY(customButton()->hasFocus() || defaultButton()->hasFocus());
    QTest::keyClick(QApplication::focusWidget(), Qt::Key_Tab);
    if (!keyWidget()->hasFocus())
        QTest::keyClick(QApplication::focusWidget(), Qt::Key_Tab);
    QVERIFY(keyWidget()->hasFocus());
    QTest::keyClick(keyWidget(), Qt::Key_Tab);
    QVERIFY(!keyWidget()->hasFocus());
    QCOMPARE(pendingKey("open"), f9);
    // A programmatic empty key counts although Tab was pressed.
    keyWidget()->clear();
    QVERIFY(pendingKey("open").isEmpty());
}

void tst_EditShortcutsDialogKeys::leavesTheFieldByTabWithModifiers_data()
{
    QTest::addColumn<int>("key");
    QTest::addColumn<int>("modifiers");
    QTest::addColumn<bool>("isBack");
    QTest::newRow("Shift+Tab of a keyboard") << int(Qt::Key_Backtab) << int(Qt::ShiftModifier) << true;
    QTest::newRow("Shift+Tab") << int(Qt::Key_Tab) << int(Qt::ShiftModifier) << true;
    QTest::newRow("Backtab") << int(Qt::Key_Backtab) << int(Qt::NoModifier) << true;
    QTest::newRow("Meta+Tab") << int(Qt::Key_Tab) << int(Qt::MetaModifier) << false;
    QTest::newRow("Tab in the second group") << int(Qt::Key_Tab) << int(Qt::GroupSwitchModifier) << false;
}

void tst_EditShortcutsDialogKeys::leavesTheFieldByTabWithModifiers()
{
    QFETCH(int, key);
    QFETCH(int, modifiers);
    QFETCH(bool, isBack);
    for (const bool isRecorded : {false, true}) {
        m_model->setKeySequence(row("open"), f9);
        record("open");
        if (isRecorded)
            press(Qt::Key_F8);
        press(key, Qt::KeyboardModifiers(modifiers));
        QVERIFY(!keyWidget()->hasFocus());
        QCOMPARE(customButton()->hasFocus(), isBack);
        QCOMPARE(pendingKey("open"), isRecorded ? QKeySequence(Qt::Key_F8) : f9);
    }
}

void tst_EditShortcutsDialogKeys::keepsTheKeyWhenAnEmptyFieldIsLeft_data()
{
    QTest::addColumn<bool>("isModifierPressed");
    QTest::newRow("untouched") << false;
    QTest::newRow("after a modifier") << true;
}

// The field is empty while the default key is the pending one.
void tst_EditShortcutsDialogKeys::keepsTheKeyWhenAnEmptyFieldIsLeft()
{
    QFETCH(bool, isModifierPressed);
    m_model->restoreDefaults();
    const QKeySequence key = pendingKey("save");
    QVERIFY(!key.isEmpty());
    record("save");
    QVERIFY(keyWidget()->keySequence().isEmpty());
    if (isModifierPressed)
        press(Qt::Key_Control);
    tree()->setFocus();
    QCOMPARE(pendingKey("save"), key);
    QVERIFY(!isChanged());
}

void tst_EditShortcutsDialogKeys::confirmsWithReturn()
{
    record("open");
    press(Qt::Key_F8);
    tree()->setFocus();
    QTest::keyClick(tree(), Qt::Key_Return);
    QVERIFY(!m_dialog->isVisible());
    QCOMPARE(open->shortcut(), QKeySequence(Qt::Key_F8));
}

VEL_TEST_MAIN(tst_EditShortcutsDialogKeys)

#include "tst_EditShortcutsDialogKeys.moc"
