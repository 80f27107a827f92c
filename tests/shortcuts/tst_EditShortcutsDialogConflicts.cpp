// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "DialogTestCase.h"
#include "QtMajor.h"

/// Which keys the dialog takes and which it refuses.
class tst_EditShortcutsDialogConflicts : public DialogTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void takesAFreeKey();
    void ignoresTheKeyThatIsCurrentAlready();
    void refusesAKeyOfAnotherShortcut();
    void refusesTheDefaultKeyOfItsOwnRowOnlyWhenAnotherHoldsIt();
    void comparesWithPendingKeys();
    void refusesAGlobalKeyBeforeALocalOne();
    void acceptsTheKeyOfAnIconAction();
    void takesAnEmptyKeyWithoutLookingItUp();
    void ignoresAKeyThatQtCannotName();
    void changesNothingWhileNoShortcutIsCurrent();
    void acceptsAPrefixOfAnotherKey();
    void survivesTheDeletionOfTheConflictingAction();
};

void tst_EditShortcutsDialogConflicts::takesAFreeKey()
{
    select("open");
    customButton()->click();
    QVERIFY(keyWidget()->isEnabled());
    QVERIFY(!isChanged());
    button(QDialogButtonBox::RestoreDefaults)->setEnabled(false);
    keyWidget()->setKeySequence(f9);
    QCOMPARE(pendingKey("open"), f9);
    QCOMPARE(open->shortcut(), f1);
    QVERIFY(isChanged());
    QVERIFY(button(QDialogButtonBox::RestoreDefaults)->isEnabled());
    QVERIFY(customButton()->isChecked());
    QCOMPARE(keyWidget()->keySequence(), f9);

    const QKeySequence chords = VelTest::keySequence(Qt::ALT | Qt::Key_A, Qt::Key_B, Qt::Key_C, Qt::Key_D);
    keyWidget()->setKeySequence(chords);
    QCOMPARE(pendingKey("open"), chords);

    // The default key by another way.
    keyWidget()->setKeySequence(f1);
    QCOMPARE(pendingKey("open"), f1);
    QVERIFY(defaultButton()->isChecked());
    QVERIFY(keyWidget()->keySequence().isEmpty());
}

void tst_EditShortcutsDialogConflicts::ignoresTheKeyThatIsCurrentAlready()
{
    write(str("keyshortcutrc"), "[ShortCutKeys]\nF1=VELWM_MENU\n");
    select("open");
    m_dialog->checkEnteredKeySequence(f1);
    QVERIFY(!isChanged());
    QCOMPARE(pendingKey("open"), f1);
}

void tst_EditShortcutsDialogConflicts::refusesAKeyOfAnotherShortcut()
{
    m_model->setKeySequence(row("open"), f9);
    select("open");
    ModalDriver modal;
    modal.answer(localConflict("F2", "Text of save"), QMessageBox::Ok);
    keyWidget()->setKeySequence(f2);
    QVERIFY(modal.finished());
    QCOMPARE(keyWidget()->keySequence(), f9);
    QCOMPARE(pendingKey("open"), f9);
    QVERIFY(!isChanged());

    modal.answer(localConflict("Ctrl+K, Ctrl+C", "Text of cut"), QMessageBox::Ok);
    m_dialog->checkEnteredKeySequence(cut->shortcut());
    QVERIFY(modal.finished());
}

void tst_EditShortcutsDialogConflicts::refusesTheDefaultKeyOfItsOwnRowOnlyWhenAnotherHoldsIt()
{
    m_model->setKeySequence(row("open"), f9);
    m_model->setKeySequence(row("save"), f1);
    select("open");
    ModalDriver modal;
    modal.answer(localConflict("F1", "Text of save"), QMessageBox::Ok);
    keyWidget()->setKeySequence(f1);
    QVERIFY(modal.finished());
    QCOMPARE(pendingKey("open"), f9);
}

void tst_EditShortcutsDialogConflicts::comparesWithPendingKeys()
{
    select("save");
    m_dialog->checkEnteredKeySequence(f9);
    select("open");
    // What "save" gave up is free, what it took is not.
    m_dialog->checkEnteredKeySequence(f2);
    QCOMPARE(pendingKey("open"), f2);
    ModalDriver modal;
    modal.answer(localConflict("F9", "Text of save"), QMessageBox::Ok);
    m_dialog->checkEnteredKeySequence(f9);
    QVERIFY(modal.finished());
    QCOMPARE(pendingKey("open"), f2);
}

void tst_EditShortcutsDialogConflicts::refusesAGlobalKeyBeforeALocalOne()
{
    write(str("keyshortcutrc"), "[ShortCutKeys]\n\"None|F2\"=\"VELWM_MENU\"\n\"Mod4|F1\"=run %1 & <b>\n");
    select("open");
    ModalDriver modal;
    modal.answer(globalConflict("F2", "VELWM_MENU"), QMessageBox::Ok);
    m_dialog->checkEnteredKeySequence(f2);
    QVERIFY(modal.finished());
    modal.answer(globalConflict("Meta+F1", "run %1 & <b>"), QMessageBox::Ok);
    keyWidget()->setKeySequence(QKeySequence(Qt::META | Qt::Key_F1));
    QVERIFY(modal.finished());
    QCOMPARE(pendingKey("open"), f1);
    QCOMPARE(keyWidget()->keySequence(), f1);
    QVERIFY(!isChanged());
}

void tst_EditShortcutsDialogConflicts::acceptsTheKeyOfAnIconAction()
{
    write(str("keyshortcutrc"), "[ShortCutKeys]\nF9=\"VELWM_SHOW_ICONS\"\nF2=VELWM_ICON\n");
    select("open");
    m_dialog->checkEnteredKeySequence(f9);
    QCOMPARE(pendingKey("open"), f9);
    ModalDriver modal;
    modal.answer(localConflict("F2", "Text of save"), QMessageBox::Ok);
    m_dialog->checkEnteredKeySequence(f2);
    QVERIFY(modal.finished());
}

void tst_EditShortcutsDialogConflicts::takesAnEmptyKeyWithoutLookingItUp()
{
    // Both would hold the empty key: this entry and the action "print".
    write(str("keyshortcutrc"), "[ShortCutKeys]\nNone+=VELWM_MENU\n");
    m_model->setKeySequence(row("open"), f9);
    select("open");
    keyWidget()->clear();
    QVERIFY(pendingKey("open").isEmpty());
    QVERIFY(isChanged());
    QVERIFY(customButton()->isChecked());
}

void tst_EditShortcutsDialogConflicts::ignoresAKeyThatQtCannotName()
{
    select("open");
    customButton()->click();
    keyWidget()->setKeySequence(QKeySequence(Qt::Key_unknown));
    QCOMPARE(pendingKey("open"), f1);
    QVERIFY(!isChanged());
    QCOMPARE(keyWidget()->keySequence(), f1);
}

void tst_EditShortcutsDialogConflicts::changesNothingWhileNoShortcutIsCurrent()
{
    m_dialog->checkEnteredKeySequence(f9);
    QVERIFY(!isChanged());
    tree()->setCurrentIndex(m_model->index(0, 0));
    m_dialog->checkEnteredKeySequence(f9);
    QVERIFY(!isChanged());
    QVERIFY(!m_model->hasKeySequence(f9));
}

void tst_EditShortcutsDialogConflicts::acceptsAPrefixOfAnotherKey()
{
    select("open");
    m_dialog->checkEnteredKeySequence(QKeySequence(Qt::CTRL | Qt::Key_K));
    QCOMPARE(pendingKey("open"), QKeySequence(Qt::CTRL | Qt::Key_K));
}

void tst_EditShortcutsDialogConflicts::survivesTheDeletionOfTheConflictingAction()
{
    select("open");
    ModalDriver modal;
    modal.answerWith(localConflict("F2", "Text of save"), [this](QMessageBox *box) {
        m_owner.reset();
        box->done(QMessageBox::Ok);
    });
    keyWidget()->setKeySequence(f2);
    QVERIFY(modal.finished());
    QVERIFY(keyWidget()->keySequence().isEmpty());
    QTRY_VERIFY(!groupBox()->isEnabled());
}

VEL_TEST_MAIN(tst_EditShortcutsDialogConflicts)
#include "tst_EditShortcutsDialogConflicts.moc"
