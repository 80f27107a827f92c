// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ActionSamples.h"
#include "FormDriving.h"
#include "ListDialogChecks.h"
#include "TestCase.h"

#include <desktopentry/EditActionsDialog.h>
#include <desktopentry/EditActionsWidget.h>

#include <QListWidget>

using namespace FormDriving;
using namespace VelUI;
using ActionSamples::actions;
using ActionSamples::ids;

class tst_EditActionsDialog : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void looksLikeItsForm();
    void waitsForAChange();
    void passesTheTextsOn();
    void acceptsAndRejectsByItsButtons();
};

void tst_EditActionsDialog::looksLikeItsForm()
{
    EditActionsDialog dialog({});
    verifyListDialogForm(dialog, "EditActionsDialog", "Actions",
                         child<EditActionsWidget>(&dialog, "listWidget"));
}

void tst_EditActionsDialog::waitsForAChange()
{
    EditActionsDialog dialog(actions({"a", "b"}));
    QVERIFY(!okButton(&dialog)->isEnabled());
    dialog.findChild<QListWidget *>()->setCurrentRow(0);
    QVERIFY(!okButton(&dialog)->isEnabled());
    click(child<QPushButton>(&dialog, "deleteButton"));
    QVERIFY(okButton(&dialog)->isEnabled());
    QCOMPARE(ids(dialog.actions()), QStringList({QStringLiteral("b")}));
    dialog.setChanged(false);
    QVERIFY(!okButton(&dialog)->isEnabled());
}

void tst_EditActionsDialog::passesTheTextsOn()
{
    EditActionsDialog dialog({});
    dialog.setTexts(QStringLiteral("plus"), QStringLiteral("change"));
    ModalDriver modal;
    modal.handle([](QWidget *window) {
        QCOMPARE(window->windowTitle(), QStringLiteral("plus"));
        window->close();
    });
    click(child<QPushButton>(&dialog, "addButton"));
    QVERIFY(modal.finished());
}

void tst_EditActionsDialog::acceptsAndRejectsByItsButtons()
{
    EditActionsDialog dialog({});
    dialog.setChanged(true);
    QCOMPARE(runAndPress(dialog, okButton), int(QDialog::Accepted));
    QCOMPARE(runAndPress(dialog, cancelButton), int(QDialog::Rejected));
}

VEL_TEST_MAIN(tst_EditActionsDialog)

#include "tst_EditActionsDialog.moc"
