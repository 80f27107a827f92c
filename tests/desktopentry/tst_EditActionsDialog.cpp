// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ActionSamples.h"
#include "FormDriving.h"
#include "TestCase.h"

#include <desktopentry/EditActionsDialog.h>
#include <desktopentry/EditActionsWidget.h>

#include <QFrame>
#include <QListWidget>
#include <QVBoxLayout>

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
    QCOMPARE(dialog.objectName(), QStringLiteral("EditActionsDialog"));
    QCOMPARE(dialog.windowTitle(), QStringLiteral("Actions"));
    QCOMPARE(dialog.size(), QSize(400, 300));
    auto *layout = qobject_cast<QVBoxLayout *>(dialog.layout());
    QVERIFY(layout);
    QCOMPARE(layout->objectName(), QStringLiteral("verticalLayout"));
    QCOMPARE(layout->itemAt(0)->widget(), child<EditActionsWidget>(&dialog, "listWidget"));
    auto *line = child<QFrame>(&dialog, "line");
    QCOMPARE(layout->itemAt(1)->widget(), line);
    QCOMPARE(line->frameShape(), QFrame::HLine);
    QCOMPARE(line->frameShadow(), QFrame::Sunken);
    auto *box = child<QDialogButtonBox>(&dialog, "buttonBox");
    QCOMPARE(layout->itemAt(2)->widget(), box);
    QCOMPARE(box->orientation(), Qt::Horizontal);
    QCOMPARE(box->standardButtons(), QDialogButtonBox::Ok | QDialogButtonBox::Cancel);
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
    const auto resultOf = [&dialog](QPushButton *(*button)(const QWidget *)) {
        ModalDriver modal;
        modal.handle([button](QWidget *window) { click(button(window)); });
        return dialog.exec();
    };
    QCOMPARE(resultOf(okButton), int(QDialog::Accepted));
    QCOMPARE(resultOf(cancelButton), int(QDialog::Rejected));
}

VEL_TEST_MAIN(tst_EditActionsDialog)

#include "tst_EditActionsDialog.moc"
