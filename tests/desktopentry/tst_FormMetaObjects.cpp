// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MetaMethods.h"
#include "TestCase.h"

#include <VelDesktopEntryEditDialog.h>
#include <VelDesktopEntryPropsWidget.h>
#include <desktopentry/ActionListEdit.h>
#include <desktopentry/ActionPropsDialog.h>
#include <desktopentry/EditActionsDialog.h>
#include <desktopentry/EditActionsWidget.h>
#include <desktopentry/EditStringsDialog.h>
#include <desktopentry/EditableListWidget.h>
#include <desktopentry/FormLayout.h>
#include <desktopentry/IconEdit.h>
#include <desktopentry/PathEdit.h>
#include <desktopentry/StringListEdit.h>

#include <QGridLayout>

Q_DECLARE_METATYPE(const QMetaObject *)

/**
 * The classes of the desktop entry forms as the meta-object system sees them.
 */
class tst_FormMetaObjects : public TestCase
{
    Q_OBJECT

private Q_SLOTS:
    void declareTheirSignalsAndSlots_data();
    void declareTheirSignalsAndSlots();
};

void tst_FormMetaObjects::declareTheirSignalsAndSlots_data()
{
    QTest::addColumn<const QMetaObject *>("meta");
    QTest::addColumn<const QMetaObject *>("base");
    QTest::addColumn<QString>("methods");
    const auto row = [](const char *name, const QMetaObject &meta, const QMetaObject &base,
                        const char *methods) {
        QTest::newRow(name) << &meta << &base << QString::fromLatin1(methods);
    };
    const QMetaObject &widget = QWidget::staticMetaObject;
    const QMetaObject &dialog = QDialog::staticMetaObject;
    const char *const listSlots = "signal changed();public slot addAction();public slot editAction();"
                                  "public slot deleteActions();public slot upAction();"
                                  "public slot downAction();public slot updateButtonsAvailability()";

    row("VelUI::FormLayout", VelUI::FormLayout::staticMetaObject, QGridLayout::staticMetaObject, "");
    row("VelUI::StringListEdit", VelUI::StringListEdit::staticMetaObject, widget,
        "signal changed();public slot editStrings()");
    row("VelUI::EditStringsDialog", VelUI::EditStringsDialog::staticMetaObject, dialog,
        "public slot setChanged(bool)");
    row("VelUI::EditableListWidget", VelUI::EditableListWidget::staticMetaObject, widget, listSlots);
    row("VelUI::ActionListEdit", VelUI::ActionListEdit::staticMetaObject, widget,
        "signal changed();public slot editActions()");
    row("VelUI::EditActionsDialog", VelUI::EditActionsDialog::staticMetaObject, dialog,
        "public slot setChanged(bool)");
    row("VelUI::EditActionsWidget", VelUI::EditActionsWidget::staticMetaObject, widget, listSlots);
    row("VelUI::ActionPropsDialog", VelUI::ActionPropsDialog::staticMetaObject, dialog,
        "public slot setChanged(bool)");
    row("VelUI::PathEdit", VelUI::PathEdit::staticMetaObject, widget,
        "signal changed();public slot clear();public slot setText(QString);"
        "public slot selectPathButtonClicked()");
    row("VelUI::IconEdit", VelUI::IconEdit::staticMetaObject, widget,
        "signal iconChanged(QString);public slot slotIconChanged(QString)");
    row("VelDesktopEntryPropsWidget", VelDesktopEntryPropsWidget::staticMetaObject, widget,
        "signal changed();signal requestedURLInfo(QString)");
    row("VelDesktopEntryEditDialog", VelDesktopEntryEditDialog::staticMetaObject, dialog,
        "public slot setDesktopEntryPath(QString,bool,QString);"
        "public slot setDesktopEntryPath(QString,bool);public slot setDesktopEntryPath(QString);"
        "public slot setDesktopEntryCoords(int,int);public slot accept();"
        "private slot copyFrom();private slot helpSlot()");
}

void tst_FormMetaObjects::declareTheirSignalsAndSlots()
{
    QFETCH(const QMetaObject *, meta);
    QFETCH(const QMetaObject *, base);
    QFETCH(QString, methods);
    QCOMPARE(QLatin1String(meta->className()), QLatin1String(QTest::currentDataTag()));
    QCOMPARE(meta->superClass(), base);
    QCOMPARE(metaMethodsOf(*meta).join(QLatin1Char(';')), methods);
}

VEL_TEST_MAIN(tst_FormMetaObjects)
#include "tst_FormMetaObjects.moc"
