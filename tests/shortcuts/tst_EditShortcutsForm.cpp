// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TestCase.h"

#include <shortcuts/EditShortcutsForm.h>
#include <shortcuts/ShortcutsTreeView.h>

#include <QDialog>
#include <QDialogButtonBox>
#include <QGroupBox>
#include <QKeySequenceEdit>
#include <QLabel>
#include <QPushButton>
#include <QRadioButton>

class tst_EditShortcutsForm : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void givesTheDialogAllItsWidgets();
    void beginsWithNothingToEdit();
    void enablesTheKeyEditorWithItsButton();
    void fillsNothingIn();
};

void tst_EditShortcutsForm::givesTheDialogAllItsWidgets()
{
    QDialog dialog;
    const EditShortcutsForm form(&dialog);
    QCOMPARE(dialog.size(), QSize(614, 504));
    const QVector<QWidget *> widgets{form.treeView,        form.groupBox,    form.defaultKeyRB,
                                     form.defaultKeyLabel, form.customKeyRB, form.keyWidget,
                                     form.buttonBox};
    QStringList names;
    for (QWidget *widget : widgets) {
        QCOMPARE(widget->window(), &dialog);
        names.append(widget->objectName());
    }
    QCOMPARE(
        names.join(QLatin1Char(' ')),
        QStringLiteral("treeView groupBox defaultKeyRB defaultKeyLabel customKeyRB keyWidget buttonBox"));
}

void tst_EditShortcutsForm::beginsWithNothingToEdit()
{
    QDialog dialog;
    const EditShortcutsForm form(&dialog);
    QVERIFY(!form.groupBox->isEnabled());
    QVERIFY(!form.keyWidget->isEnabled());
    QVERIFY(form.keyWidget->keySequence().isEmpty());
    QVERIFY(form.buttonBox->button(QDialogButtonBox::RestoreDefaults)->isEnabled());
}

void tst_EditShortcutsForm::enablesTheKeyEditorWithItsButton()
{
    QDialog dialog;
    const EditShortcutsForm form(&dialog);
    form.groupBox->setEnabled(true);
    form.customKeyRB->setChecked(true);
    QVERIFY(form.keyWidget->isEnabled());
    form.defaultKeyRB->setChecked(true);
    QVERIFY(!form.keyWidget->isEnabled());
}

void tst_EditShortcutsForm::fillsNothingIn()
{
    QDialog dialog;
    const EditShortcutsForm form(&dialog);
    QVERIFY(!form.treeView->model());
    QVERIFY(form.defaultKeyLabel->text().isEmpty());
    QCOMPARE(form.treeView->editTriggers(), QAbstractItemView::NoEditTriggers);
}

VEL_TEST_MAIN(tst_EditShortcutsForm)

#include "tst_EditShortcutsForm.moc"
