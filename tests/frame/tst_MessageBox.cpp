// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ModalDriver.h"
#include "TestCase.h"

#include <frame/GuardedDialog.h>
#include <frame/MessageBox.h>

#include <QAbstractButton>
#include <QDialog>

/// Modal windows that may lose their parent while they are open.
class tst_MessageBox : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void answersWithThePressedButton_data();
    void answersWithThePressedButton();
    void hasTheDefaultButtonAskedFor();
    void answersWithNoButtonWhenTheParentGoes();
    void showsTheTextAsItIs();

    void runsADialog_data();
    void runsADialog();
    void noticesThatTheParentTookTheDialogWithIt();
    void endsTheDialogWithTheScope();

private:
    static ModalDriver::Box question(QMessageBox::StandardButton defaultButton = QMessageBox::NoButton);
};

ModalDriver::Box tst_MessageBox::question(QMessageBox::StandardButton defaultButton)
{
    return {QMessageBox::Question, QStringLiteral("Attention"), QStringLiteral("Go on?"),
            QMessageBox::Yes | QMessageBox::No, defaultButton};
}

void tst_MessageBox::answersWithThePressedButton_data()
{
    QTest::addColumn<int>("button");
    QTest::newRow("Yes") << int(QMessageBox::Yes);
    QTest::newRow("No") << int(QMessageBox::No);
}

void tst_MessageBox::answersWithThePressedButton()
{
    QFETCH(int, button);
    QWidget parent;
    ModalDriver modal;
    modal.answer(question(), QMessageBox::StandardButton(button));
    QCOMPARE(int(MessageBox::show(&parent, QMessageBox::Question, QStringLiteral("Attention"),
                                  QStringLiteral("Go on?"), QMessageBox::Yes | QMessageBox::No)),
             button);
    QVERIFY(modal.finished());
    QVERIFY(parent.findChildren<QMessageBox *>().isEmpty());
}

void tst_MessageBox::hasTheDefaultButtonAskedFor()
{
    ModalDriver modal;
    modal.answerWith(question(QMessageBox::No),
                     [](QMessageBox *box) { QTest::keyClick(box, Qt::Key_Return); });
    QCOMPARE(MessageBox::show(nullptr, QMessageBox::Question, QStringLiteral("Attention"),
                              QStringLiteral("Go on?"), QMessageBox::Yes | QMessageBox::No, QMessageBox::No),
             QMessageBox::No);
    QVERIFY(modal.finished());
}

void tst_MessageBox::answersWithNoButtonWhenTheParentGoes()
{
    auto *parent = new QWidget;
    ModalDriver modal;
    modal.answerWith(question(), [parent](QMessageBox *) { delete parent; });
    QCOMPARE(MessageBox::show(parent, QMessageBox::Question, QStringLiteral("Attention"),
                              QStringLiteral("Go on?"), QMessageBox::Yes | QMessageBox::No),
             QMessageBox::NoButton);
    QVERIFY(modal.finished());
}

void tst_MessageBox::showsTheTextAsItIs()
{
    const QString text = QStringLiteral("Can't start:\n<b>a</b> &amp; <i>b</i>");
    ModalDriver modal;
    modal.answerWith({QMessageBox::Warning, QStringLiteral("Warning"), text}, [](QMessageBox *box) {
        // Also where the text looks like rich text.
        QCOMPARE(box->textFormat(), Qt::PlainText);
        box->button(QMessageBox::Ok)->click();
    });
    MessageBox::show(nullptr, QMessageBox::Warning, QStringLiteral("Warning"), text);
    QVERIFY(modal.finished());
}

void tst_MessageBox::runsADialog_data()
{
    QTest::addColumn<int>("result");
    QTest::newRow("accepted") << int(QDialog::Accepted);
    QTest::newRow("rejected") << int(QDialog::Rejected);
}

void tst_MessageBox::runsADialog()
{
    QFETCH(int, result);
    QWidget parent;
    GuardedDialog<QDialog> dialog(&parent);
    ModalDriver modal;
    modal.handle([result](QWidget *window) { qobject_cast<QDialog *>(window)->done(result); });
    QCOMPARE(dialog.run(), result == QDialog::Accepted);
    QVERIFY(dialog.isAlive());
    QCOMPARE(dialog->parentWidget(), &parent);
}

void tst_MessageBox::noticesThatTheParentTookTheDialogWithIt()
{
    auto *parent = new QWidget;
    GuardedDialog<QDialog> dialog(parent);
    ModalDriver modal;
    modal.handle([parent](QWidget *window) {
        qobject_cast<QDialog *>(window)->accept();
        delete parent;
    });
    QVERIFY(!dialog.run());
    QVERIFY(!dialog.isAlive());
}

void tst_MessageBox::endsTheDialogWithTheScope()
{
    QPointer<QDialog> watched;
    QWidget parent;
    {
        const GuardedDialog<QDialog> dialog(&parent);
        watched = dialog.operator->();
        QVERIFY(watched);
    }
    QVERIFY(!watched);
}

VEL_TEST_MAIN(tst_MessageBox)
#include "tst_MessageBox.moc"
