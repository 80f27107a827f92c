// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FormDriving.h"
#include "ListDialogChecks.h"
#include "TestCase.h"

#include <desktopentry/EditStringsDialog.h>
#include <desktopentry/EditableListWidget.h>

#include <QListWidget>

using namespace FormDriving;
using VelUI::EditableListWidget;
using VelUI::EditStringsDialog;

namespace {

const QStringList abc{QStringLiteral("a"), QStringLiteral("b"), QStringLiteral("c")};

QString answerX(QWidget *, const QString &, const QString &, QLineEdit::EchoMode, const QString &)
{
    return QStringLiteral("x");
}

QString title;

QString noteTitle(QWidget *, const QString &given, const QString &, QLineEdit::EchoMode, const QString &)
{
    title = given;
    return QString();
}

} // namespace

class tst_EditStringsDialog : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void looksLikeItsForm();
    void showsTheStringsAndWaitsForAChange();
    void enablesOkAfterAnyChange_data();
    void enablesOkAfterAnyChange();
    void countsAMoveThereAndBackAsAChange();
    void leavesOkWhenThePromptIsCanceled();
    void passesTheTextsAndTheFunctionOn();
    void acceptsAndRejectsByItsButtons();
};

void tst_EditStringsDialog::looksLikeItsForm()
{
    EditStringsDialog dialog({});
    verifyListDialogForm(dialog, "EditStringsDialog", "Strings",
                         child<EditableListWidget>(&dialog, "listWidget"));
}

void tst_EditStringsDialog::showsTheStringsAndWaitsForAChange()
{
    EditStringsDialog dialog(abc);
    QCOMPARE(dialog.strings(), abc);
    QVERIFY(!okButton(&dialog)->isEnabled());
    dialog.setChanged(true);
    QVERIFY(okButton(&dialog)->isEnabled());
    dialog.setChanged(false);
    QVERIFY(!okButton(&dialog)->isEnabled());
}

void tst_EditStringsDialog::enablesOkAfterAnyChange_data()
{
    QTest::addColumn<QString>("button");
    QTest::addColumn<QStringList>("strings");
    const QString a = QStringLiteral("a"), b = QStringLiteral("b"), c = QStringLiteral("c"),
                  x = QStringLiteral("x");
    QTest::newRow("add") << "addButton" << QStringList{a, b, c, x};
    QTest::newRow("edit") << "editButton" << QStringList{a, x, c};
    QTest::newRow("delete") << "deleteButton" << QStringList{a, c};
    QTest::newRow("up") << "upButton" << QStringList{b, a, c};
    QTest::newRow("down") << "downButton" << QStringList{a, c, b};
}

void tst_EditStringsDialog::enablesOkAfterAnyChange()
{
    QFETCH(QString, button);
    QFETCH(QStringList, strings);
    EditStringsDialog dialog(abc);
    dialog.setInputFunction(answerX);
    dialog.findChild<QListWidget *>()->setCurrentRow(1);
    QVERIFY(!okButton(&dialog)->isEnabled());
    click(dialog.findChild<QPushButton *>(button));
    QVERIFY(okButton(&dialog)->isEnabled());
    QCOMPARE(dialog.strings(), strings);
}

void tst_EditStringsDialog::countsAMoveThereAndBackAsAChange()
{
    EditStringsDialog dialog(abc);
    dialog.findChild<QListWidget *>()->setCurrentRow(1);
    click(child<QPushButton>(&dialog, "upButton"));
    click(child<QPushButton>(&dialog, "downButton"));
    QCOMPARE(dialog.strings(), abc);
    QVERIFY(okButton(&dialog)->isEnabled());
}

void tst_EditStringsDialog::leavesOkWhenThePromptIsCanceled()
{
    EditStringsDialog dialog(abc);
    ModalDriver modal;
    answerPrompt(modal, QString());
    answerPrompt(modal, QStringLiteral(""));
    click(child<QPushButton>(&dialog, "addButton"));
    click(child<QPushButton>(&dialog, "addButton"));
    QVERIFY(modal.finished());
    QVERIFY(!okButton(&dialog)->isEnabled());
    QCOMPARE(dialog.strings(), abc);
}

void tst_EditStringsDialog::passesTheTextsAndTheFunctionOn()
{
    EditStringsDialog dialog({});
    dialog.setInputFunction(noteTitle);
    dialog.setTexts(QStringLiteral("one"), QStringLiteral("two"), QStringLiteral("three"),
                    QStringLiteral("four"));
    click(child<QPushButton>(&dialog, "addButton"));
    QCOMPARE(title, QStringLiteral("one"));
}

void tst_EditStringsDialog::acceptsAndRejectsByItsButtons()
{
    EditStringsDialog dialog(abc);
    dialog.setChanged(true);
    QCOMPARE(runAndPress(dialog, okButton), int(QDialog::Accepted));
    QCOMPARE(runAndPress(dialog, cancelButton), int(QDialog::Rejected));
}

VEL_TEST_MAIN(tst_EditStringsDialog)

#include "tst_EditStringsDialog.moc"
