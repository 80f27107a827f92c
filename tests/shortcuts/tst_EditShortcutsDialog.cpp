// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "DialogTestCase.h"
#include "MetaMethods.h"

#include <QAccessible>
#include <QGridLayout>
#include <QTranslator>
#include <QVBoxLayout>

namespace {

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

/// What the dialog shows, and the ways back to default keys.
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
    void goesBackToTheDefaultKey();
    void goesBackToNoKey();
    void goesBackToNoKeyWhereTheWordForNoneIsAKey();
    void restoresAllDefaults();
    void resetsAllEdits();
    void ignoresOtherButtons();
    void refreshesTheFirstRowOnResetAndRestore();
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

VEL_TEST_MAIN(tst_EditShortcutsDialog)
#include "tst_EditShortcutsDialog.moc"
