// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "DialogTestCase.h"

#include <QPointer>
#include <QSignalSpy>
#include <QTimer>

/// What becomes of the edits when the dialog closes, and what it survives.
class tst_EditShortcutsDialogClosing : public DialogTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void commitsOnOk();
    void throwsTheEditsAwayOnCancel();
    void throwsTheEditsAwayOnEscape_data();
    void throwsTheEditsAwayOnEscape();
    void throwsTheEditsAwayWhenTheHostRejectsIt();
    void closesUnaskedWhileNothingIsChanged();
    void asksBeforeItCloses_data();
    void asksBeforeItCloses();
    void staysOpenWhenClosingIsCanceled();
    void survivesTheDeletionOfTheCurrentAction();
    void survivesItsDeletionInsideAMessage();
    void survivesItsDeletionOnOk();
    void survivesItsDeletionOnClosing();
    void outlivesItsModel();
    void goesWithItsParentAndModel();
    void goesBeforeAModelThatIsItsChild();
};

void tst_EditShortcutsDialogClosing::commitsOnOk()
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

void tst_EditShortcutsDialogClosing::throwsTheEditsAwayOnCancel()
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

void tst_EditShortcutsDialogClosing::throwsTheEditsAwayOnEscape_data()
{
    QTest::addColumn<bool>("byDialog");
    QTest::newRow("made in the dialog") << true;
    QTest::newRow("made in the model") << false;
}

void tst_EditShortcutsDialogClosing::throwsTheEditsAwayOnEscape()
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

void tst_EditShortcutsDialogClosing::throwsTheEditsAwayWhenTheHostRejectsIt()
{
    m_dialog->show();
    select("open");
    m_dialog->checkEnteredKeySequence(f9);
    m_dialog->reject();
    QCOMPARE(pendingKey("open"), f1);
    QVERIFY(!isChanged());
}

void tst_EditShortcutsDialogClosing::closesUnaskedWhileNothingIsChanged()
{
    m_dialog->show();
    QVERIFY(m_dialog->close());
    QVERIFY(!m_dialog->isVisible());
    QCOMPARE(m_dialog->result(), int(QDialog::Rejected));
}

void tst_EditShortcutsDialogClosing::asksBeforeItCloses_data()
{
    QTest::addColumn<int>("answer");
    QTest::addColumn<int>("result");
    QTest::addColumn<QKeySequence>("key");
    QTest::newRow("yes") << int(QMessageBox::Yes) << int(QDialog::Accepted) << f9;
    QTest::newRow("no") << int(QMessageBox::No) << int(QDialog::Rejected) << f1;
}

void tst_EditShortcutsDialogClosing::asksBeforeItCloses()
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

void tst_EditShortcutsDialogClosing::staysOpenWhenClosingIsCanceled()
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

void tst_EditShortcutsDialogClosing::survivesTheDeletionOfTheCurrentAction()
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

void tst_EditShortcutsDialogClosing::survivesItsDeletionInsideAMessage()
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

void tst_EditShortcutsDialogClosing::survivesItsDeletionOnOk()
{
    m_dialog->show();
    select("open");
    m_dialog->checkEnteredKeySequence(f9);
    connect(open, &QAction::changed, this, [this] { m_dialog.reset(); });
    m_dialog->slotAccept();
    QVERIFY(!m_dialog);
    QCOMPARE(open->shortcut(), f9);
}

void tst_EditShortcutsDialogClosing::survivesItsDeletionOnClosing()
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

void tst_EditShortcutsDialogClosing::outlivesItsModel()
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

void tst_EditShortcutsDialogClosing::goesWithItsParentAndModel()
{
    auto *window = new QWidget;
    const QPointer<ShortcutsModel> model = new ShortcutsModel(nullptr, QString(), window);
    auto *action = new QAction(window);
    model->registerAction(str("x"), action, str("g"));
    const QPointer<EditShortcutsDialog> dialog = new EditShortcutsDialog(model, window);
    const QPointer<ShortcutsModel> inner = new ShortcutsModel(nullptr, QString(), dialog);
    const QPointer<EditShortcutsDialog> second = new EditShortcutsDialog(inner, dialog);
    dialog->show();
    second->show();
    delete window;
    QVERIFY(!dialog && !model);
    QVERIFY(!second && !inner);
}

void tst_EditShortcutsDialogClosing::goesBeforeAModelThatIsItsChild()
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

VEL_TEST_MAIN(tst_EditShortcutsDialogClosing)
#include "tst_EditShortcutsDialogClosing.moc"
