// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "AssistedTestCase.h"

#include <QAccessible>
#include <QGridLayout>
#include <QLineEdit>
#include <QMainWindow>
#include <QMenuBar>
#include <QScrollBar>

/// What the assisted dialog tells of a key, and how.
class tst_KeyAssistance : public AssistedTestCase
{
    Q_OBJECT

private Q_SLOTS:
    void tellsOfThePendingKey();
    void tellsOfTheDefaultKey();
    void looksAtTheWindowOfTheHost();
    void leavesOutWhatTheApplicationChoseItself();
    void tellsOfFurtherKeysWithoutRefusingThem();
    void followsTheModel();
    void isEmptyWhileNoShortcutIsCurrent();
    void survivesItsModel();

    void keepsItsPlace_data();
    void keepsItsPlace();
    void tellsOfManyClashes();
    void scrollsByKeyboard();
    void showsNamesAsPlainText();
    void goesToAShortcutThatIsFiltered();
    void leavesOkTheDefaultButton();

    void alertsAssistivePrograms();
    void isNamed();
    void goesWithoutATrace();

private:
    // Actions that have all the same key.
    void addMany(int count, const QKeySequence &key)
    {
        for (int i = 0; i < count; ++i)
            addAction(qPrintable(str("many%1").arg(i, 2, 10, QLatin1Char('0'))), "Many", key);
    }
};

void tst_KeyAssistance::tellsOfThePendingKey()
{
    select("print");
    QVERIFY(lines().isEmpty());
    m_model->setKeySequence(row("print"), f2);
    QTRY_COMPARE(texts(), QStringList{sameKey("F2", "Text of save")});
    select("copy");
    QTRY_VERIFY(lines().isEmpty());
    select("save");
    QTRY_COMPARE(texts(), QStringList{sameKey("F2", "Text of print")});
}

void tst_KeyAssistance::tellsOfTheDefaultKey()
{
    m_model->setKeySequence(row("open"), f9);
    m_model->setKeySequence(row("print"), f1);
    select("open");
    const ModalDriver modal;
    XDoTool::click(defaultButton());
    QTRY_COMPARE(pendingKey("open"), f1);
    QTRY_COMPARE(texts(), QStringList{sameKey("F1", "Text of print")});
    XDoTool::click(lineButton(0, "Take over"));
    QTRY_COMPARE(pendingKey("print"), QKeySequence());
    QCOMPARE(pendingKey("open"), f1);
    QVERIFY(defaultButton()->isChecked());
    QTRY_VERIFY(lines().isEmpty());
    QVERIFY(isChanged());
    QVERIFY(modal.finished());
}

void tst_KeyAssistance::looksAtTheWindowOfTheHost()
{
    QMainWindow window;
    window.menuBar()->addMenu(str("&File"));
    m_dialog.reset(new EditShortcutsDialog(m_model.get(), &window));
    m_dialog->setAssistance(true);
    m_model->setKeySequence(row("open"), QKeySequence(Qt::ALT | Qt::Key_F));
    select("open");
    QTRY_COMPARE(texts(), QStringList{str("Shortcut 'Alt+F' opens the menu 'File'.")});
    m_dialog.reset();
}

void tst_KeyAssistance::leavesOutWhatTheApplicationChoseItself()
{
    const QKeySequence ctrlP(QKeySequence::Print);
    addAction("standard", "File", ctrlP);
    select("standard");
    m_model->setKeySequence(row("open"), f9);
    QTest::qWait(0);
    QVERIFY(lines().isEmpty());
    m_model->setKeySequence(row("standard"), f9);
    m_model->setKeySequence(row("open"), ctrlP);
    select("open");
    QTRY_COMPARE(texts(), QStringList{str("Shortcut 'Ctrl+P' is the standard shortcut for 'Print'.")});
}

void tst_KeyAssistance::tellsOfFurtherKeysWithoutRefusingThem()
{
    save->setShortcuts({f2, ctrlJ});
    const ModalDriver modal;
    recordClash("open", str("ctrl+j"));
    QCOMPARE(texts(), QStringList{str("Shortcut 'Ctrl+J' is a further shortcut of action 'Text of save'.")});
    QVERIFY(lineButton(0, "Go to"));
    QVERIFY(!lineButton(0, "Take over"));
    QTRY_COMPARE(pendingKey("open"), ctrlJ);
    XDoTool::click(lineButton(0, "Go to"));
    QTRY_COMPARE(tree()->currentIndex(), row("save"));
    QCOMPARE(pendingKey("open"), ctrlJ);
    QVERIFY(modal.finished());
}

void tst_KeyAssistance::followsTheModel()
{
    recordClash("open", str("F2"));
    m_model->setKeySequence(row("print"), f2);
    QTRY_COMPARE(texts(), (QStringList{sameKey("F2", "Text of print"), sameKey("F2", "Text of save")}));
    QAction *late = addAction("late", "Edit", f2);
    QTRY_COMPARE(lines().size(), 3);
    delete late;
    QTRY_COMPARE(lines().size(), 2);
    m_model->setKeySequence(row("print"), f9);
    m_model->setKeySequence(row("save"), f9);
    QTRY_VERIFY(lines().isEmpty());
    // Nothing is in the way any more.
    const ModalDriver modal;
    XDoTool::click(tree()->viewport(), tree()->visualRect(row("copy")).center());
    QTRY_COMPARE(pendingKey("open"), f2);
    QVERIFY(modal.finished());
}

void tst_KeyAssistance::isEmptyWhileNoShortcutIsCurrent()
{
    m_model->setKeySequence(row("print"), f2);
    select("print");
    QTRY_COMPARE(lines().size(), 1);
    tree()->setCurrentIndex(m_model->index(0, 0));
    QTRY_VERIFY(lines().isEmpty());
    select("print");
    QTRY_COMPARE(lines().size(), 1);
    delete print;
    QTRY_VERIFY(lines().isEmpty());
}

void tst_KeyAssistance::survivesItsModel()
{
    const ModalDriver modal;
    recordClash("open", str("F2"));
    const QPointer<QPushButton> takeOver = lineButton(0, "Take over");
    m_model.reset();
    if (takeOver)
        takeOver->click();
    noneButton()->click();
    QTRY_VERIFY(lines().isEmpty());
    QVERIFY(!isChanged());
    m_dialog->setAssistance(false);
    QVERIFY(modal.finished());
}

void tst_KeyAssistance::keepsItsPlace_data()
{
    QTest::addColumn<QSize>("size");
    QTest::newRow("at first") << QSize();
    QTest::newRow("small screen") << QSize(1024, 560);
    QTest::newRow("as small as can be") << QSize(1, 1);
}

void tst_KeyAssistance::keepsItsPlace()
{
    QFETCH(QSize, size);
    addMany(30, f9);
    if (size.isValid()) {
        m_dialog->resize(size);
        QTest::qWait(100);
    }
    select("copy");
    QTest::qWait(0);
    const QRect treePlace = tree()->geometry();
    const QRect boxPlace = clashBox()->geometry();
    const QSize dialogSize = m_dialog->size();
    QVERIFY(treePlace.height() > 50);
    for (const QKeySequence &key : {f2, f9, QKeySequence()}) {
        m_model->setKeySequence(row("copy"), key);
        QTest::qWait(50);
        QCOMPARE(lines().isEmpty(), key.isEmpty());
        QCOMPARE(tree()->geometry(), treePlace);
        QCOMPARE(clashBox()->geometry(), boxPlace);
        QCOMPARE(m_dialog->size(), dialogSize);
    }
    QVERIFY(clashBox()->height() < 4 * noneButton()->height() + 20);
}

void tst_KeyAssistance::tellsOfManyClashes()
{
    addMany(25, f9);
    m_model->setKeySequence(row("copy"), f9);
    select("copy");
    QTRY_COMPARE(lines().size(), 21);
    QCOMPARE(texts().constLast(), str("Further clashes: 5"));
    QVERIFY(lines().constLast()->findChildren<QPushButton *>().isEmpty());
    lineButton(0, "Take over")->click();
    QTRY_COMPARE(texts().constLast(), str("Further clashes: 4"));
}

void tst_KeyAssistance::scrollsByKeyboard()
{
    addMany(8, f9);
    m_model->setKeySequence(row("copy"), f9);
    record("copy");
    QTRY_COMPARE(lines().size(), 8);
    QCOMPARE(clashBox()->verticalScrollBar()->value(), 0);
    // The buttons of all lines, the box itself, and then the next one.
    for (int i = 0; i < 16; ++i) {
        XDoTool::press(str("Tab"));
        QPushButton *button = lineButton(i / 2, i % 2 == 0 ? "Go to" : "Take over");
        QTRY_VERIFY(button->hasFocus());
        const QRect place(button->mapTo(clashBox()->viewport(), QPoint()), button->size());
        QVERIFY(clashBox()->viewport()->rect().contains(place));
    }
    QVERIFY(clashBox()->verticalScrollBar()->value() > 0);
    XDoTool::press(str("Tab"));
    QTRY_VERIFY(clashBox()->hasFocus());
    XDoTool::run(str("key --clearmodifiers --repeat 5 Prior"));
    QTRY_COMPARE(clashBox()->verticalScrollBar()->value(), 0);
    XDoTool::press(str("Tab"));
    QTRY_VERIFY(noneButton()->hasFocus());
    m_model->setKeySequence(row("copy"), ctrlJ);
    QTRY_COMPARE(clashBox()->focusPolicy(), Qt::NoFocus);
}

void tst_KeyAssistance::showsNamesAsPlainText()
{
    save->setText(str("<b>bold</b>"));
    m_model->setKeySequence(row("open"), f2);
    select("open");
    QTRY_COMPARE(texts(), QStringList{sameKey("F2", "<b>bold</b>")});
    QCOMPARE(lines().constFirst()->findChildren<QLabel *>().constLast()->textFormat(), Qt::PlainText);
}

void tst_KeyAssistance::goesToAShortcutThatIsFiltered()
{
    m_model->setKeySequence(row("open"), f2);
    child<QLineEdit>("filterEdit")->setText(str("open"));
    select("open");
    QTRY_COMPARE(lines().size(), 1);
    QVERIFY(tree()->isRowHidden(row("save").row(), row("save").parent()));
    XDoTool::click(lineButton(0, "Go to"));
    QTRY_COMPARE(tree()->currentIndex(), row("save"));
    QVERIFY(!tree()->isRowHidden(row("save").row(), row("save").parent()));
    QVERIFY(tree()->viewport()->rect().contains(tree()->visualRect(row("save"))));
}

void tst_KeyAssistance::leavesOkTheDefaultButton()
{
    QVERIFY(button(QDialogButtonBox::Ok)->isDefault());
    m_model->setKeySequence(row("print"), f2);
    m_dialog->setChanged(true);
    select("print");
    QTRY_COMPARE(lines().size(), 1);
    tree()->setFocus();
    XDoTool::press(str("Return"));
    QTRY_VERIFY(!m_dialog->isVisible());
    QCOMPARE(m_dialog->result(), int(QDialog::Accepted));
}

// That the line is announced cannot be seen here: without a program that listens Qt sends no events.
void tst_KeyAssistance::alertsAssistivePrograms()
{
    m_model->setKeySequence(row("print"), f2);
    select("print");
    QTRY_COMPARE(lines().size(), 1);
    const QAccessibleInterface *interface = QAccessible::queryAccessibleInterface(lines().constFirst());
    QCOMPARE(interface->role(), QAccessible::AlertMessage);
    QCOMPARE(interface->text(QAccessible::Name), sameKey("F2", "Text of save"));
    QCOMPARE(interface->childCount(), 4);
}

void tst_KeyAssistance::isNamed()
{
    m_model->setKeySequence(row("print"), f2);
    select("print");
    QTRY_COMPARE(lines().size(), 1);
    QCOMPARE(lineButton(0, "Go to")->accessibleName(), str("Go to action 'Text of save'"));
    QCOMPARE(lineButton(0, "Take over")->accessibleName(), str("Take over 'F2' from action 'Text of save'"));
    QCOMPARE(noneButton()->text(), str("None"));
    QCOMPARE(noneButton()->accessibleName(), str("None: no key for action 'Text of print'"));
    QCOMPARE(clashBox()->accessibleName(), str("What speaks against the key for action 'Text of print'"));
    const auto *inner = keyWidget()->findChild<QLineEdit *>();
    QCOMPARE(inner->accessibleName(), str("Key for action 'Text of print'"));
    select("copy");
    QTRY_COMPARE(inner->accessibleName(), str("Key for action 'Text of copy'"));
}

void tst_KeyAssistance::goesWithoutATrace()
{
    const EditShortcutsDialog plain(m_model.get());
    const auto *plainField = plain.findChild<QKeySequenceEdit *>();
    ModalDriver modal;
    recordClash("open", str("F2"));
    XDoTool::press(str("Tab"));
    QTRY_VERIFY(lineButton(0, "Go to")->hasFocus());
    m_dialog->setAssistance(false);
    QVERIFY(!clashBox());
    QVERIFY(!noneButton());
    QCOMPARE(keyWidget()->toolTip(), plainField->toolTip());
    QCOMPARE(keyWidget()->accessibleDescription(), plainField->accessibleDescription());
    QCOMPARE(keyWidget()->findChild<QLineEdit *>()->accessibleName(),
             plainField->findChild<QLineEdit *>()->accessibleName());
    const auto *grid = qobject_cast<QGridLayout *>(groupBox()->layout());
    QCOMPARE(grid->columnStretch(2), 0);
    QCOMPARE(grid->count(), 4);
    // The key that waited is dropped, and the next one is refused at once.
    QCOMPARE(pendingKey("open"), f1);
    QVERIFY(!isChanged());
    QVERIFY(modal.finished());
    modal.answer(localConflict("F2", "Text of save"), QMessageBox::Ok);
    recordUnfinished("open", str("F2"));
    QTRY_VERIFY(modal.finished() && !QApplication::activeModalWidget());
}

VEL_TEST_MAIN(tst_KeyAssistance)

#include "tst_KeyAssistance.moc"
