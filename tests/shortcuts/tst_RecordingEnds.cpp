// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// A recording in which something else happens: the window closes, a button is pressed. Keys and
// clicks come from the X server.

#include "RecordingTestCase.h"

#include <QWindow>

namespace {

const QKeySequence ctrlJ(Qt::CTRL | Qt::Key_J);
const QKeySequence f1(Qt::Key_F1);
const QKeySequence f9(Qt::Key_F9);

} // namespace

class tst_RecordingEnds : public RecordingTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void asksWhenTheWindowIsClosedMeanwhile_data();
    void asksWhenTheWindowIsClosedMeanwhile();
    void closesWithoutAQuestionAfterAModifier();
    void dropsTheKeyWhenTheHostRejects_data();
    void dropsTheKeyWhenTheHostRejects();
    void throwsEditsAwayWhenTheHostIsDoneWithRejected();
    void acceptsTheKeyWithOk_data();
    void acceptsTheKeyWithOk();
    void acceptsTheKeyWhenTheHostAccepts();
    void staysWithOneMessageWhenTheKeyIsTaken_data();
    void staysWithOneMessageWhenTheKeyIsTaken();
    void tellsOfATakenKeyAfterTheClick_data();
    void tellsOfATakenKeyAfterTheClick();
    void choosesTheRowThatIsClickedWhenTheKeyIsTaken_data();
    void choosesTheRowThatIsClickedWhenTheKeyIsTaken();
    void dropsTheKeyWhenCancelIsClicked_data();
    void dropsTheKeyWhenCancelIsClicked();
    void enablesOkWithTheFirstChord();
    void disablesOkWhenTheRecordingComesToNothing_data();
    void disablesOkWhenTheRecordingComesToNothing();
    void leavesOkEnabledWhenSomethingElseChanged();

private:
    void closeByTitleBar();
};

// The last button of the title bar.
void tst_RecordingEnds::closeByTitleBar()
{
    const QWindow *window = m_dialog->windowHandle();
    QTRY_VERIFY(window->frameMargins().top() > 0);
    const QRect frame = window->frameGeometry();
    const int titleHeight = window->frameMargins().top();
    XDoTool::run(str("mousemove %1 %2 sleep 0.1 click 1")
                     .arg(frame.right() - titleHeight / 2)
                     .arg(frame.top() + titleHeight / 2));
}

void tst_RecordingEnds::asksWhenTheWindowIsClosedMeanwhile_data()
{
    QTest::addColumn<int>("answer");
    QTest::addColumn<QKeySequence>("pending");
    QTest::addColumn<QKeySequence>("inForce");
    QTest::newRow("Yes") << int(QMessageBox::Yes) << ctrlJ << ctrlJ;
    QTest::newRow("No") << int(QMessageBox::No) << f1 << f1;
    QTest::newRow("Cancel") << int(QMessageBox::Cancel) << ctrlJ << f1;
}

void tst_RecordingEnds::asksWhenTheWindowIsClosedMeanwhile()
{
    QFETCH(int, answer);
    QFETCH(QKeySequence, pending);
    QFETCH(QKeySequence, inForce);
    ModalDriver modal;
    modal.answer(closeQuestion(), QMessageBox::StandardButton(answer));
    recordUnfinished("open", str("ctrl+j"));
    closeByTitleBar();
    QTRY_VERIFY(modal.finished() && !QApplication::activeModalWidget());
    QCOMPARE(m_dialog->isVisible(), answer == QMessageBox::Cancel);
    QVERIFY(keysStay());
    QCOMPARE(pendingKey("open"), pending);
    QCOMPARE(open->shortcut(), inForce);
}

void tst_RecordingEnds::closesWithoutAQuestionAfterAModifier()
{
    const ModalDriver modal;
    record("open");
    XDoTool::press(str("ctrl"));
    closeByTitleBar();
    QTRY_VERIFY(!m_dialog->isVisible());
    QVERIFY(modal.finished());
    QVERIFY(keysStay());
    QCOMPARE(pendingKey("open"), f1);
}

void tst_RecordingEnds::dropsTheKeyWhenTheHostRejects_data()
{
    QTest::addColumn<QString>("how");
    for (const char *how : {"reject", "done", "hide", "slotReject"})
        QTest::newRow(how) << str(how);
}

void tst_RecordingEnds::dropsTheKeyWhenTheHostRejects()
{
    QFETCH(QString, how);
    const ModalDriver modal;
    recordUnfinished("open", str("ctrl+j"));
    if (how == str("reject"))
        m_dialog->reject();
    else if (how == str("done"))
        m_dialog->done(QDialog::Rejected);
    else if (how == str("hide"))
        m_dialog->hide();
    else
        m_dialog->slotReject();
    QVERIFY(!m_dialog->isVisible());
    QCOMPARE(pendingKey("open"), f1);
    QVERIFY(keysStay());
    QVERIFY(!isChanged());
    QVERIFY(modal.finished());

    // Nothing is left for the next time.
    m_dialog->show();
    QVERIFY(QTest::qWaitForWindowActive(m_dialog.get()));
    m_dialog->slotAccept();
    QCOMPARE(open->shortcut(), f1);
}

void tst_RecordingEnds::throwsEditsAwayWhenTheHostIsDoneWithRejected()
{
    recordUnfinished("open", str("ctrl+j"));
    QTRY_COMPARE(pendingKey("open"), ctrlJ);
    m_dialog->done(QDialog::Rejected);
    QCOMPARE(pendingKey("open"), f1);
    QVERIFY(!isChanged());
}

void tst_RecordingEnds::acceptsTheKeyWithOk_data()
{
    QTest::addColumn<bool>("byMouse");
    QTest::newRow("clicked by the host") << false;
    QTest::newRow("clicked by the mouse") << true;
}

void tst_RecordingEnds::acceptsTheKeyWithOk()
{
    QFETCH(bool, byMouse);
    m_model->setKeySequence(row("save"), f9);
    m_dialog->setChanged(true);
    recordUnfinished("open", str("ctrl+j"));
    if (byMouse)
        XDoTool::click(button(QDialogButtonBox::Ok));
    else
        button(QDialogButtonBox::Ok)->click();
    QTRY_VERIFY(!m_dialog->isVisible());
    QCOMPARE(m_dialog->result(), int(QDialog::Accepted));
    QCOMPARE(open->shortcut(), ctrlJ);
    QCOMPARE(save->shortcut(), f9);
    QVERIFY(keysStay());
    QCOMPARE(pendingKey("open"), ctrlJ);
}

void tst_RecordingEnds::acceptsTheKeyWhenTheHostAccepts()
{
    recordUnfinished("open", str("ctrl+j"));
    m_dialog->accept();
    QVERIFY(!m_dialog->isVisible());
    // A host that accepts by itself commits by itself.
    QCOMPARE(pendingKey("open"), ctrlJ);
    QCOMPARE(open->shortcut(), f1);
}

void tst_RecordingEnds::staysWithOneMessageWhenTheKeyIsTaken_data()
{
    QTest::addColumn<QString>("how");
    QTest::addColumn<bool>("changedBefore");
    for (const bool changedBefore : {false, true}) {
        const char *note = changedBefore ? "changed before" : "unchanged before";
        for (const char *how : {"title bar", "close", "slotAccept", "accept", "Ok by click()", "Ok"})
            QTest::addRow("%s, %s", how, note) << str(how) << changedBefore;
    }
}

void tst_RecordingEnds::staysWithOneMessageWhenTheKeyIsTaken()
{
    QFETCH(QString, how);
    QFETCH(bool, changedBefore);
    if (changedBefore) {
        m_model->setKeySequence(row("print"), f9);
        m_dialog->setChanged(true);
    }
    recordUnfinished("open", str("F2"));
    ModalDriver modal;
    modal.answer(localConflict("F2", "Text of save"), QMessageBox::Ok);
    if (how == str("title bar"))
        closeByTitleBar();
    else if (how == str("close"))
        QVERIFY(!m_dialog->close());
    else if (how == str("slotAccept"))
        m_dialog->slotAccept();
    else if (how == str("accept"))
        m_dialog->accept();
    else if (how == str("Ok by click()"))
        button(QDialogButtonBox::Ok)->click();
    else
        XDoTool::click(button(QDialogButtonBox::Ok));
    QTRY_VERIFY(modal.finished() && !QApplication::activeModalWidget());
    QVERIFY(keysStay());
    QVERIFY(m_dialog->isVisible());
    QCOMPARE(pendingKey("open"), f1);
    QCOMPARE(keyWidget()->keySequence(), f1);
    QCOMPARE(print->shortcut(), QKeySequence());
    QCOMPARE(isChanged(), changedBefore);
}

void tst_RecordingEnds::tellsOfATakenKeyAfterTheClick_data()
{
    QTest::addColumn<int>("which");
    QTest::newRow("restore defaults") << int(QDialogButtonBox::RestoreDefaults);
    QTest::newRow("reset") << int(QDialogButtonBox::Reset);
}

void tst_RecordingEnds::tellsOfATakenKeyAfterTheClick()
{
    QFETCH(int, which);
    m_model->setKeySequence(row("print"), f9);
    m_dialog->setChanged(true);
    QPushButton *pressed = button(QDialogButtonBox::StandardButton(which));
    recordUnfinished("open", str("F2"));
    QSignalSpy clicked(pressed, &QPushButton::clicked);
    ModalDriver modal;
    modal.answerWith(localConflict("F2", "Text of save"), [&](QMessageBox *box) {
        QCOMPARE(clicked.count(), 1);
        box->button(QMessageBox::Ok)->click();
    });
    // Held for a while, as hands do.
    XDoTool::run(str("mousemove %1 sleep 0.1 mousedown 1 sleep 0.4 mouseup 1")
                     .arg(XDoTool::at(pressed, pressed->rect().center())));
    QTRY_VERIFY(modal.finished() && !QApplication::activeModalWidget());
    QVERIFY(!pressed->isDown());
    QCOMPARE(clicked.count(), 1);
    QCOMPARE(pendingKey("print"), QKeySequence());
    QCOMPARE(pendingKey("open"), f1);
    QVERIFY(keysStay());
}

void tst_RecordingEnds::choosesTheRowThatIsClickedWhenTheKeyIsTaken_data()
{
    QTest::addColumn<bool>("isGroup");
    QTest::newRow("another action") << false;
    QTest::newRow("a group") << true;
}

void tst_RecordingEnds::choosesTheRowThatIsClickedWhenTheKeyIsTaken()
{
    QFETCH(bool, isGroup);
    const QModelIndex clicked = isGroup ? row("copy").parent() : row("copy");
    recordUnfinished("open", str("F2"));
    ModalDriver modal;
    modal.answer(localConflict("F2", "Text of save"), QMessageBox::Ok);
    XDoTool::click(tree()->viewport(), tree()->visualRect(clicked).center());
    QTRY_VERIFY(modal.finished() && !QApplication::activeModalWidget());
    QCOMPARE(tree()->currentIndex(), clicked);
    QVERIFY(!isChanged());
    // No button is thought to be held: the pointer selects nothing.
    XDoTool::run(str("mousemove %1 sleep 0.2")
                     .arg(XDoTool::at(tree()->viewport(), tree()->visualRect(row("print")).center())));
    QCOMPARE(tree()->currentIndex(), clicked);
}

void tst_RecordingEnds::dropsTheKeyWhenCancelIsClicked_data()
{
    QTest::addColumn<QString>("key");
    QTest::newRow("free") << str("F8");
    QTest::newRow("taken") << str("F2");
}

void tst_RecordingEnds::dropsTheKeyWhenCancelIsClicked()
{
    QFETCH(QString, key);
    const ModalDriver modal;
    recordUnfinished("open", key);
    XDoTool::click(button(QDialogButtonBox::Cancel));
    QTRY_VERIFY(!m_dialog->isVisible());
    QVERIFY(keysStay());
    QVERIFY(modal.finished());
    QCOMPARE(pendingKey("open"), f1);
    QVERIFY(!isChanged());
}

void tst_RecordingEnds::enablesOkWithTheFirstChord()
{
    record("open");
    XDoTool::press(str("ctrl"));
    QVERIFY(!isChanged());
    XDoTool::run(str("keydown ctrl keydown j"));
    QTRY_VERIFY(isChanged());
    QCOMPARE(pendingKey("open"), f1);
    XDoTool::run(str("keyup j keyup ctrl"));
    XDoTool::click(button(QDialogButtonBox::Ok));
    QTRY_VERIFY(!m_dialog->isVisible());
    QCOMPARE(open->shortcut(), ctrlJ);
}

void tst_RecordingEnds::disablesOkWhenTheRecordingComesToNothing_data()
{
    QTest::addColumn<QString>("how");
    for (const char *how : {"the same key", "taken key", "another row", "the host sets a key", "Reset"})
        QTest::newRow(how) << str(how);
}

void tst_RecordingEnds::disablesOkWhenTheRecordingComesToNothing()
{
    QFETCH(QString, how);
    ModalDriver modal;
    recordUnfinished("open", how == str("the same key") ? str("F1") : str("F2"));
    QVERIFY(isChanged());
    if (how == str("taken key"))
        modal.answer(localConflict("F2", "Text of save"), QMessageBox::Ok);
    else if (how == str("another row"))
        select("copy");
    else if (how == str("the host sets a key"))
        m_model->setKeySequence(row("open"), f9);
    else if (how == str("Reset"))
        button(QDialogButtonBox::Reset)->click();
    QTRY_VERIFY(!isChanged());
    QVERIFY(!button(QDialogButtonBox::Reset)->isEnabled());
    QTRY_VERIFY(modal.finished() && !QApplication::activeModalWidget());
    QVERIFY(keysStay());
}

void tst_RecordingEnds::leavesOkEnabledWhenSomethingElseChanged()
{
    recordUnfinished("print", str("F9"));
    QTRY_COMPARE(pendingKey("print"), f9);
    ModalDriver modal;
    modal.answer(localConflict("F2", "Text of save"), QMessageBox::Ok);
    recordUnfinished("open", str("F2"));
    QTRY_VERIFY(modal.finished() && !QApplication::activeModalWidget());
    QVERIFY(isChanged());

    // The host has the last word about it.
    recordUnfinished("open", str("F8"));
    m_dialog->setChanged(false);
    QVERIFY(isChanged());
    select("copy");
    QVERIFY(!isChanged());
}

VEL_TEST_MAIN(tst_RecordingEnds)

#include "tst_RecordingEnds.moc"
