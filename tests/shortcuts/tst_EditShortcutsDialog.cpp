// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "DialogTestCase.h"
#include "MetaMethods.h"

#include <QAccessible>
#include <QGridLayout>
#include <QSignalSpy>
#include <QTimer>
#include <QTranslator>
#include <QVBoxLayout>

namespace {

const QKeySequence f1(Qt::Key_F1);
const QKeySequence f2(Qt::Key_F2);
const QKeySequence f9(Qt::Key_F9);

// The Chinese word for no key, in force while it lives.
class ChineseNone : public QTranslator
{
    Q_OBJECT

public:
    ChineseNone() { QCoreApplication::installTranslator(this); }
    ~ChineseNone() override { QCoreApplication::removeTranslator(this); }

    QString translate(const char *context, const char *source, const char *, int) const override
    {
        const bool isNone = qstrcmp(context, "EditShortcutsDialog") == 0 && qstrcmp(source, "None") == 0;
        return isNone ? QString(QChar(0x65e0)) : QString();
    }
    bool isEmpty() const override { return false; }
};

} // namespace

class tst_EditShortcutsDialog : public DialogTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void hasTheFormThatIsDesigned();
    void hasTheSlotsThatAreDesigned();
    void tellsScreenReadersWhatItsFieldsAre();
    void beginsUnchangedWithNothingToEdit();
    void showsAllGroupsOpenWithReadableColumns();
    void showsADefaultKey();
    void showsACustomKey();
    void showsThatThereIsNoDefaultKey();
    void disablesTheKeyWhileAGroupIsCurrent();

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

    void goesBackToTheDefaultKey();
    void goesBackToNoKey();
    void goesBackToNoKeyWhereTheWordForNoneIsAKey();
    void restoresAllDefaults();
    void resetsAllEdits();
    void ignoresOtherButtons();
    void refreshesTheFirstRowOnResetAndRestore();

    void commitsOnOk();
    void throwsTheEditsAwayOnCancel();
    void throwsTheEditsAwayOnEscape_data();
    void throwsTheEditsAwayOnEscape();
    void throwsTheEditsAwayWhenTheHostRejectsIt();
    void closesUnaskedWhileNothingIsChanged();
    void asksBeforeItCloses_data();
    void asksBeforeItCloses();
    void staysOpenWhenClosingIsCancelled();

    void bearsTheCurrentActionGoing();
    void bearsTheConflictingActionGoing();
    void bearsItsOwnEndInsideAMessage();
    void bearsItsOwnEndOnOk();
    void bearsItsOwnEndOnClosing();
    void outlivesItsModel();
    void goesWithItsParentAndModel();
    void goesBeforeAModelThatIsItsChild();
};

void tst_EditShortcutsDialog::hasTheFormThatIsDesigned()
{
    QCOMPARE(m_dialog->objectName(), str("EditShortcutsDialog"));
    QCOMPARE(m_dialog->windowTitle(), str("Configure shortcuts"));
    QCOMPARE(m_dialog->size(), QSize(614, 504));
    auto *vertical = child<QVBoxLayout>("verticalLayout");
    QCOMPARE(m_dialog->layout(), vertical);
    QCOMPARE(vertical->itemAt(0)->widget(), tree());
    QCOMPARE(vertical->itemAt(1)->widget(), groupBox());
    QCOMPARE(vertical->itemAt(2)->widget(), child<QDialogButtonBox>("buttonBox"));
    QCOMPARE(groupBox()->title(), str("Choose a key for selected action"));

    auto *grid = child<QGridLayout>("gridLayout");
    QCOMPARE(groupBox()->layout(), grid);
    const auto position = [grid](QWidget *widget) {
        int row = -1;
        int column = -1;
        int rows = -1;
        int columns = -1;
        grid->getItemPosition(grid->indexOf(widget), &row, &column, &rows, &columns);
        return QVector<int>{row, column, rows, columns};
    };
    QCOMPARE(position(defaultButton()), QVector<int>({0, 0, 2, 1}));
    QCOMPARE(position(defaultLabel()), QVector<int>({0, 1, 2, 2}));
    QCOMPARE(position(customButton()), QVector<int>({2, 0, 1, 1}));
    QCOMPARE(position(keyWidget()), QVector<int>({2, 1, 1, 2}));
    QCOMPARE(defaultButton()->text(), str("Default key:"));
    QCOMPARE(customButton()->text(), str("Assign key:"));
    QCOMPARE(int(defaultLabel()->textFormat()), int(Qt::PlainText)); // a key may be "<"
    QCOMPARE(int(child<QDialogButtonBox>("buttonBox")->standardButtons()),
             int(QDialogButtonBox::Ok | QDialogButtonBox::Cancel | QDialogButtonBox::Reset
                 | QDialogButtonBox::RestoreDefaults));
}

void tst_EditShortcutsDialog::hasTheSlotsThatAreDesigned()
{
    QCOMPARE(metaMethodsOf(EditShortcutsDialog::staticMetaObject),
             QStringList({str("public slot checkCurrentShortcut(QKeySequence,QKeySequence)"),
                          str("public slot checkEnteredKeySequence(QKeySequence)"),
                          str("public slot disableShortcutEdit()"),
                          str("public slot processButtonBox(QAbstractButton*)"),
                          str("public slot setDefaultShortcut()"), str("public slot slotAccept()"),
                          str("public slot slotReject()")}));
    QCOMPARE(metaMethodsOf(ShortcutsTreeView::staticMetaObject),
             QStringList({str("signal currentShortcutChanged(QKeySequence,QKeySequence)"),
                          str("signal currentItemIsNotShortcut()"),
                          str("public slot setKeySequence(QKeySequence)")}));
    QCOMPARE(
        metaMethodsOf(ShortcutsModel::staticMetaObject),
        QStringList({str("public slot restoreDefaults()"), str("public slot resetShortcuts()"),
                     str("public slot commitChanges()"), str("public slot saveKeys(QSettings*,QString)")}));
}

void tst_EditShortcutsDialog::tellsScreenReadersWhatItsFieldsAre()
{
    const auto textOf = [](QWidget *widget, QAccessible::Text kind) {
        return QAccessible::queryAccessibleInterface(widget)->text(kind);
    };
    QCOMPARE(textOf(tree(), QAccessible::Name), str("Configure shortcuts"));
    QCOMPARE(textOf(keyWidget(), QAccessible::Name), str("Assign key:"));
    // The label beside the button is not reached by the keyboard.
    select("open");
    QCOMPARE(textOf(defaultButton(), QAccessible::Name), str("Default key:"));
    QCOMPARE(textOf(defaultButton(), QAccessible::Description), str("F1"));
    select("print");
    QCOMPARE(textOf(defaultButton(), QAccessible::Description), str("None"));
}

void tst_EditShortcutsDialog::beginsUnchangedWithNothingToEdit()
{
    QVERIFY(!isChanged());
    QVERIFY(!button(QDialogButtonBox::Reset)->isEnabled());
    QVERIFY(button(QDialogButtonBox::RestoreDefaults)->isEnabled());
    QVERIFY(!groupBox()->isEnabled());
    QVERIFY(!keyWidget()->isEnabled());
    m_dialog->setChanged(true);
    QVERIFY(isChanged());
    QVERIFY(button(QDialogButtonBox::Reset)->isEnabled());
}

void tst_EditShortcutsDialog::showsAllGroupsOpenWithReadableColumns()
{
    addAction("a quite long text that would not fit into a narrow column", "Edit", f9);
    m_dialog.reset(new EditShortcutsDialog(m_model.get()));
    QCOMPARE(tree()->editTriggers(), QAbstractItemView::NoEditTriggers);
    QCOMPARE(tree()->model(), m_model.get());
    for (int group = 0; group < 2; ++group)
        QVERIFY(tree()->isExpanded(m_model->index(group, 0)));
    m_dialog->show();
    QVERIFY(QTest::qWaitForWindowExposed(m_dialog.get()));
    const QFontMetrics metrics(tree()->font());
    const QString longest =
        row("a quite long text that would not fit into a narrow column").data().toString();
    QVERIFY(tree()->columnWidth(0) > metrics.horizontalAdvance(longest));
    QVERIFY(tree()->columnWidth(1) > metrics.horizontalAdvance(str("Ctrl+K, Ctrl+C")));
}

void tst_EditShortcutsDialog::showsADefaultKey()
{
    select("open");
    QVERIFY(groupBox()->isEnabled());
    QVERIFY(defaultButton()->isChecked());
    QVERIFY(!customButton()->isChecked());
    QCOMPARE(defaultLabel()->text(), str("F1"));
    QVERIFY(keyWidget()->keySequence().isEmpty());
    QVERIFY(!keyWidget()->isEnabled());
    QVERIFY(!isChanged());
}

void tst_EditShortcutsDialog::showsACustomKey()
{
    m_model->setKeySequence(row("open"), f9);
    select("save");
    select("open");
    QVERIFY(customButton()->isChecked());
    QVERIFY(!defaultButton()->isChecked());
    QCOMPARE(defaultLabel()->text(), str("F1"));
    QCOMPARE(keyWidget()->keySequence(), f9);
    QVERIFY(keyWidget()->isEnabled());
    QVERIFY(!isChanged());
    select("cut");
    QVERIFY(defaultButton()->isChecked());
    QCOMPARE(defaultLabel()->text(), str("Ctrl+K, Ctrl+C"));
    QVERIFY(!keyWidget()->isEnabled());
    QVERIFY(!isChanged());
    QCOMPARE(pendingKey("open"), f9);
}

void tst_EditShortcutsDialog::showsThatThereIsNoDefaultKey()
{
    select("print");
    QVERIFY(defaultButton()->isChecked());
    QCOMPARE(defaultLabel()->text(), str("None"));
}

void tst_EditShortcutsDialog::disablesTheKeyWhileAGroupIsCurrent()
{
    select("open");
    tree()->setCurrentIndex(m_model->index(1, 0));
    QVERIFY(!groupBox()->isEnabled());
    select("open");
    QVERIFY(groupBox()->isEnabled());
}

void tst_EditShortcutsDialog::takesAFreeKey()
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

    const QKeySequence chords(Qt::ALT | Qt::Key_A, Qt::Key_B, Qt::Key_C, Qt::Key_D);
    keyWidget()->setKeySequence(chords);
    QCOMPARE(pendingKey("open"), chords);

    // The default key by another way.
    keyWidget()->setKeySequence(f1);
    QCOMPARE(pendingKey("open"), f1);
    QVERIFY(defaultButton()->isChecked());
    QVERIFY(keyWidget()->keySequence().isEmpty());
}

void tst_EditShortcutsDialog::ignoresTheKeyThatIsCurrentAlready()
{
    write(str("keyshortcutrc"), "[ShortCutKeys]\nF1=VELWM_MENU\n");
    select("open");
    m_dialog->checkEnteredKeySequence(f1);
    QVERIFY(!isChanged());
    QCOMPARE(pendingKey("open"), f1);
}

void tst_EditShortcutsDialog::refusesAKeyOfAnotherShortcut()
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

void tst_EditShortcutsDialog::refusesTheDefaultKeyOfItsOwnRowOnlyWhenAnotherHoldsIt()
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

void tst_EditShortcutsDialog::comparesWithPendingKeys()
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

void tst_EditShortcutsDialog::refusesAGlobalKeyBeforeALocalOne()
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

void tst_EditShortcutsDialog::acceptsTheKeyOfAnIconAction()
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

void tst_EditShortcutsDialog::takesAnEmptyKeyWithoutLookingItUp()
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

void tst_EditShortcutsDialog::ignoresAKeyThatQtCannotName()
{
    select("open");
    customButton()->click();
    keyWidget()->setKeySequence(QKeySequence(Qt::Key_unknown));
    QCOMPARE(pendingKey("open"), f1);
    QVERIFY(!isChanged());
    QCOMPARE(keyWidget()->keySequence(), f1);
}

void tst_EditShortcutsDialog::changesNothingWhileNoShortcutIsCurrent()
{
    m_dialog->checkEnteredKeySequence(f9);
    QVERIFY(!isChanged());
    tree()->setCurrentIndex(m_model->index(0, 0));
    m_dialog->checkEnteredKeySequence(f9);
    QVERIFY(!isChanged());
    QVERIFY(!m_model->hasKeySequence(f9));
}

void tst_EditShortcutsDialog::acceptsAPrefixOfAnotherKey()
{
    select("open");
    m_dialog->checkEnteredKeySequence(QKeySequence(Qt::CTRL | Qt::Key_K));
    QCOMPARE(pendingKey("open"), QKeySequence(Qt::CTRL | Qt::Key_K));
}

void tst_EditShortcutsDialog::goesBackToTheDefaultKey()
{
    select("cut");
    m_dialog->checkEnteredKeySequence(f9);
    m_dialog->setChanged(false);
    button(QDialogButtonBox::RestoreDefaults)->setEnabled(false);
    defaultButton()->click();
    QCOMPARE(pendingKey("cut"), cut->shortcut());
    QVERIFY(keyWidget()->keySequence().isEmpty());
    QVERIFY(!keyWidget()->isEnabled());
    QVERIFY(isChanged());
    QVERIFY(button(QDialogButtonBox::RestoreDefaults)->isEnabled());

    m_dialog->setChanged(false);
    customButton()->setChecked(true);
    m_dialog->setDefaultShortcut();
    QVERIFY(!isChanged());
}

void tst_EditShortcutsDialog::goesBackToNoKey()
{
    select("print");
    m_dialog->checkEnteredKeySequence(f9);
    QVERIFY(customButton()->isChecked());
    defaultButton()->click();
    QCOMPARE(pendingKey("print"), QKeySequence());
    QCOMPARE(pendingKey("print").count(), 0);
    QCOMPARE(defaultLabel()->text(), str("None"));
    QVERIFY(defaultButton()->isChecked());
}

void tst_EditShortcutsDialog::goesBackToNoKeyWhereTheWordForNoneIsAKey()
{
    const ChineseNone chinese;
    select("print");
    m_dialog->checkEnteredKeySequence(f9);
    QCOMPARE(QKeySequence(defaultLabel()->text()), QKeySequence(0x65e0));
    defaultButton()->click();
    QCOMPARE(pendingKey("print").count(), 0);
}

void tst_EditShortcutsDialog::restoresAllDefaults()
{
    open->setShortcut(f9);
    m_model->resetShortcuts();
    select("open");
    QCOMPARE(keyWidget()->keySequence(), f9);
    button(QDialogButtonBox::RestoreDefaults)->click();
    QCOMPARE(pendingKey("open"), f1);
    QCOMPARE(open->shortcut(), f9);
    QVERIFY(isChanged());
    QVERIFY(!button(QDialogButtonBox::RestoreDefaults)->isEnabled());
    QVERIFY(defaultButton()->isChecked());
    m_dialog->checkEnteredKeySequence(QKeySequence(Qt::Key_F8));
    QVERIFY(button(QDialogButtonBox::RestoreDefaults)->isEnabled());
}

void tst_EditShortcutsDialog::resetsAllEdits()
{
    select("save");
    m_dialog->checkEnteredKeySequence(f9);
    button(QDialogButtonBox::RestoreDefaults)->click();
    button(QDialogButtonBox::Reset)->click();
    QCOMPARE(pendingKey("save"), f2);
    QVERIFY(!isChanged());
    QVERIFY(!button(QDialogButtonBox::Reset)->isEnabled());
    QVERIFY(button(QDialogButtonBox::RestoreDefaults)->isEnabled());
}

void tst_EditShortcutsDialog::ignoresOtherButtons()
{
    select("open");
    m_dialog->checkEnteredKeySequence(f9);
    m_dialog->processButtonBox(button(QDialogButtonBox::Ok));
    m_dialog->processButtonBox(button(QDialogButtonBox::Cancel));
    m_dialog->processButtonBox(defaultButton());
    QCOMPARE(pendingKey("open"), f9);
    QCOMPARE(open->shortcut(), f1);
    QVERIFY(isChanged());
}

void tst_EditShortcutsDialog::refreshesTheFirstRowOnResetAndRestore()
{
    // The first row of the first group, current in column 0.
    QCOMPARE(row("open").row(), 0);
    select("open");
    m_dialog->checkEnteredKeySequence(f9);
    QVERIFY(customButton()->isChecked());
    button(QDialogButtonBox::Reset)->click();
    QVERIFY(defaultButton()->isChecked());
    m_dialog->checkEnteredKeySequence(f9);
    button(QDialogButtonBox::RestoreDefaults)->click();
    QVERIFY(defaultButton()->isChecked());
    QVERIFY(!keyWidget()->isEnabled());
}

void tst_EditShortcutsDialog::commitsOnOk()
{
    m_dialog->show();
    select("open");
    m_dialog->checkEnteredKeySequence(f9);
    QSignalSpy spy(m_dialog.get(), &QDialog::accepted);
    button(QDialogButtonBox::Ok)->click();
    QCOMPARE(spy.count(), 1);
    QCOMPARE(open->shortcut(), f9);
    QVERIFY(!isChanged());
    QVERIFY(!m_dialog->isVisible());
    QCOMPARE(m_dialog->result(), int(QDialog::Accepted));
}

void tst_EditShortcutsDialog::throwsTheEditsAwayOnCancel()
{
    m_dialog->show();
    select("open");
    m_dialog->checkEnteredKeySequence(f9);
    QSignalSpy spy(m_dialog.get(), &QDialog::rejected);
    button(QDialogButtonBox::Cancel)->click();
    QCOMPARE(spy.count(), 1);
    QCOMPARE(open->shortcut(), f1);
    QCOMPARE(pendingKey("open"), f1);
    QVERIFY(!isChanged());
    QVERIFY(!m_dialog->isVisible());
}

void tst_EditShortcutsDialog::throwsTheEditsAwayOnEscape_data()
{
    QTest::addColumn<bool>("byDialog");
    QTest::newRow("made in the dialog") << true;
    QTest::newRow("made in the model") << false;
}

void tst_EditShortcutsDialog::throwsTheEditsAwayOnEscape()
{
    QFETCH(bool, byDialog);
    m_dialog->show();
    select("open");
    if (byDialog)
        m_dialog->checkEnteredKeySequence(f9);
    else
        m_model->setKeySequence(row("open"), f9);
    QSignalSpy spy(m_dialog.get(), &QDialog::rejected);
    QTest::keyClick(tree(), Qt::Key_Escape);
    QCOMPARE(spy.count(), 1);
    QCOMPARE(pendingKey("open"), f1);
    QVERIFY(!isChanged());
    QVERIFY(!m_dialog->isVisible());
}

void tst_EditShortcutsDialog::throwsTheEditsAwayWhenTheHostRejectsIt()
{
    m_dialog->show();
    select("open");
    m_dialog->checkEnteredKeySequence(f9);
    m_dialog->reject();
    QCOMPARE(pendingKey("open"), f1);
    QVERIFY(!isChanged());
}

void tst_EditShortcutsDialog::closesUnaskedWhileNothingIsChanged()
{
    m_dialog->show();
    QVERIFY(m_dialog->close());
    QVERIFY(!m_dialog->isVisible());
    QCOMPARE(m_dialog->result(), int(QDialog::Rejected));
}

void tst_EditShortcutsDialog::asksBeforeItCloses_data()
{
    QTest::addColumn<int>("answer");
    QTest::addColumn<int>("result");
    QTest::addColumn<QKeySequence>("key");
    QTest::newRow("yes") << int(QMessageBox::Yes) << int(QDialog::Accepted) << f9;
    QTest::newRow("no") << int(QMessageBox::No) << int(QDialog::Rejected) << f1;
}

void tst_EditShortcutsDialog::asksBeforeItCloses()
{
    QFETCH(int, answer);
    m_dialog->show();
    select("open");
    m_dialog->checkEnteredKeySequence(f9);
    ModalDriver modal;
    modal.answer(closeQuestion(), QMessageBox::StandardButton(answer));
    QSignalSpy spy(m_dialog.get(), &QDialog::finished);
    QVERIFY(m_dialog->close());
    QVERIFY(modal.finished());
    QCOMPARE(spy.count(), 1);
    QVERIFY(!m_dialog->isVisible());
    QTEST(m_dialog->result(), "result");
    QTEST(open->shortcut(), "key");
    QTEST(pendingKey("open"), "key");
}

void tst_EditShortcutsDialog::staysOpenWhenClosingIsCancelled()
{
    m_dialog->show();
    select("open");
    m_dialog->checkEnteredKeySequence(f9);
    ModalDriver modal;
    modal.answer(closeQuestion(), QMessageBox::Cancel);
    QVERIFY(!m_dialog->close());
    QVERIFY(modal.finished());
    QVERIFY(m_dialog->isVisible());
    QVERIFY(isChanged());
    QCOMPARE(pendingKey("open"), f9);
    QCOMPARE(open->shortcut(), f1);
}

void tst_EditShortcutsDialog::bearsTheCurrentActionGoing()
{
    m_dialog->show();
    select("open");
    m_dialog->checkEnteredKeySequence(f9);
    delete open;
    m_dialog->checkEnteredKeySequence(QKeySequence(Qt::Key_F8));
    m_dialog->setDefaultShortcut();
    QTRY_VERIFY(!groupBox()->isEnabled());
    QVERIFY(!m_model->hasKeySequence(QKeySequence(Qt::Key_F8)));
    button(QDialogButtonBox::Reset)->click();
    button(QDialogButtonBox::RestoreDefaults)->click();
    delete m_owner.release();
    button(QDialogButtonBox::Ok)->click();
}

void tst_EditShortcutsDialog::bearsTheConflictingActionGoing()
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

void tst_EditShortcutsDialog::bearsItsOwnEndInsideAMessage()
{
    select("open");
    // Not within an event of the box itself.
    const auto endDialog = [this](QMessageBox *) {
        QTimer::singleShot(0, this, [this] { m_dialog.reset(); });
    };
    ModalDriver modal;
    modal.answerWith(localConflict("F2", "Text of save"), endDialog);
    m_dialog->checkEnteredKeySequence(f2);
    QVERIFY(!m_dialog);

    m_dialog.reset(new EditShortcutsDialog(m_model.get()));
    m_dialog->show();
    m_dialog->setChanged(true);
    modal.answerWith(closeQuestion(), endDialog);
    m_dialog->close();
    QVERIFY(modal.finished());
    QVERIFY(!m_dialog);
}

void tst_EditShortcutsDialog::bearsItsOwnEndOnOk()
{
    m_dialog->show();
    select("open");
    m_dialog->checkEnteredKeySequence(f9);
    connect(open, &QAction::changed, this, [this] { m_dialog.reset(); });
    m_dialog->slotAccept();
    QVERIFY(!m_dialog);
    QCOMPARE(open->shortcut(), f9);
}

void tst_EditShortcutsDialog::bearsItsOwnEndOnClosing()
{
    m_dialog->show();
    select("open");
    m_dialog->checkEnteredKeySequence(f9);
    connect(open, &QAction::changed, this, [this] { m_dialog.reset(); });
    ModalDriver modal;
    modal.answer(closeQuestion(), QMessageBox::Yes);
    m_dialog->close();
    QVERIFY(modal.finished());
    QVERIFY(!m_dialog);
    QCOMPARE(open->shortcut(), f9);
}

void tst_EditShortcutsDialog::outlivesItsModel()
{
    m_dialog->show();
    select("open");
    m_dialog->checkEnteredKeySequence(f9);
    m_model.reset();
    QVERIFY(!groupBox()->isEnabled());
    m_dialog->checkEnteredKeySequence(f2);
    m_dialog->setDefaultShortcut();
    button(QDialogButtonBox::Reset)->click();
    button(QDialogButtonBox::RestoreDefaults)->click();
    m_dialog->slotAccept();
    m_dialog->slotReject();
}

void tst_EditShortcutsDialog::goesWithItsParentAndModel()
{
    auto *window = new QWidget;
    auto *model = new ShortcutsModel(nullptr, QString(), window);
    auto *action = new QAction(window);
    model->registerAction(str("x"), action, str("g"));
    auto *dialog = new EditShortcutsDialog(model, window);
    auto *inner = new ShortcutsModel(nullptr, QString(), dialog);
    auto *second = new EditShortcutsDialog(inner, dialog);
    dialog->show();
    second->show();
    delete window;
}

void tst_EditShortcutsDialog::goesBeforeAModelThatIsItsChild()
{
    QAction action;
    auto *model = new ShortcutsModel(nullptr, QString());
    model->registerAction(str("x"), &action, str("g"));
    const QPointer<ShortcutsModel> guard(model);
    {
        EditShortcutsDialog dialog(model);
        model->setParent(&dialog);
        dialog.show();
        dialog.findChild<QTreeView *>(str("treeView"))
            ->setCurrentIndex(model->index(0, 0, model->index(0, 0)));
    }
    QVERIFY(!guard);
}

VEL_TEST_MAIN(tst_EditShortcutsDialog)

#include "tst_EditShortcutsDialog.moc"
