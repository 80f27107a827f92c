// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// The type of the entry: the combo box, what is shown for a type, and the question before a change.

#include "VelDesktopEntryPropsWidgetPrivate.h"

#include "EntryTypeRules.h"
#include "fields/FormLayout.h"
#include "fields/NamedField.h"

#include <VelDesktopEntryPropsWidget.h>
#include <frame/GuardedDialog.h>

#include <QComboBox>
#include <QEvent>
#include <QMessageBox>
#include <QPointer>
#include <QSignalBlocker>
#include <QToolButton>

#include <utility>

using namespace VelUI;
using Form = VelDesktopEntryPropsWidgetPrivate;

namespace {

using ShownFor = PropsRow::ShownFor;

QIcon typeIcon(const QString &type)
{
    if (type == EntryTypeRules::Link)
        return QIcon::fromTheme(QStringLiteral("text-html"));
    if (type == EntryTypeRules::Directory)
        return QIcon::fromTheme(QStringLiteral("folder"));
    return QIcon::fromTheme(QStringLiteral("system-run"));
}

} // namespace

int VelDesktopEntryPropsWidgetPrivate::addTypeRow(const QString &label)
{
    typeBox = makeField<QComboBox>("typeComboBox", content);
    // The wheel scrolls the form; on its way over the box it must not change the type.
    typeBox->setFocusPolicy(Qt::StrongFocus);
    // Long names of the types must not make the form wider than its window.
    typeBox->setMinimumContentsLength(8);
    typeBox->installEventFilter(this);
    return layout->addRow(label, typeBox);
}

bool VelDesktopEntryPropsWidgetPrivate::eventFilter(QObject *watched, QEvent *event)
{
    if (watched == typeBox && event->type() == QEvent::Wheel && !typeBox->hasFocus()) {
        event->ignore();
        return true;
    }
    return QObject::eventFilter(watched, event);
}

void VelDesktopEntryPropsWidgetPrivate::setType(const QString &newType, const QStringList &newAllowedTypes)
{
    const QStringList allowed = EntryTypeRules::choices(newAllowedTypes);
    if (newType.isEmpty() || !allowed.contains(newType))
        return;
    if (newType == type && allowed == allowedTypes)
        return;
    if (allowed != allowedTypes) {
        allowedTypes = allowed;
        fillTypeBox();
    }
    applyType(newType);
}

QString VelDesktopEntryPropsWidgetPrivate::typeName(const QString &type)
{
    if (type == EntryTypeRules::Application)
        return tr("Application");
    if (type == EntryTypeRules::Link)
        return tr("Link");
    if (type == EntryTypeRules::Directory)
        return tr("Directory");
    return type;
}

void VelDesktopEntryPropsWidgetPrivate::fillTypeBox()
{
    const QSignalBlocker blocker(typeBox);
    typeBox->clear();
    for (const QString &allowed : std::as_const(allowedTypes))
        typeBox->addItem(typeIcon(allowed), typeName(allowed), allowed);
}

void VelDesktopEntryPropsWidgetPrivate::selectType()
{
    const QSignalBlocker blocker(typeBox);
    typeBox->setCurrentIndex(typeBox->findData(type, Qt::UserRole, Qt::MatchFixedString));
}

void VelDesktopEntryPropsWidgetPrivate::applyType(const QString &newType)
{
    type = newType;
    selectType();
    setRowsShown(ShownFor::Applications);
    setRowsShown(ShownFor::Links);
    layout->setRowVisible(typeRow, EntryTypeRules::hasChoice(type, allowedTypes));
    urlInfoButton->setVisible(showURLInfoButton && isShown(ShownFor::Links));
}

bool VelDesktopEntryPropsWidgetPrivate::isShown(ShownFor group) const
{
    return EntryTypeRules::isShown(group, type);
}

void VelDesktopEntryPropsWidgetPrivate::setRowsShown(ShownFor group)
{
    const bool shown = isShown(group);
    for (const PropsRow &row : rows()) {
        if (row.shownFor != group)
            continue;
        if (row.number)
            layout->setRowVisible(this->*row.number, shown);
        else
            row.field(*this)->setVisible(shown);
        if (!shown)
            row.clear(*this);
    }
}

void VelDesktopEntryPropsWidgetPrivate::typeChosen(int index)
{
    const QString chosen = typeBox->itemData(index).toString();
    if (chosen.isEmpty() || chosen == type)
        return;
    const QPointer<Form> self(this);
    const bool isConfirmed = confirmTypeChange();
    if (!self)
        return;
    if (!isConfirmed) {
        selectType();
        return;
    }
    applyType(chosen);
    Q_EMIT q->changed();
}

bool VelDesktopEntryPropsWidgetPrivate::confirmTypeChange()
{
    // By hand: the ready-made question adds a No button to make No the default.
    GuardedDialog<QMessageBox> box(
        QMessageBox::Question, tr("Attention"),
        tr("Desktop entry type was changed.\nSome field values may be lost...\nContinue?"), QMessageBox::Yes,
        q);
    box->setDefaultButton(QMessageBox::No);

    const QPointer<Form> self(this);
    QComboBox *const orphan = isAskingForType ? nullptr : typeBox;
    isAskingForType = true;
    const int answer = box.exec();
    if (self)
        isAskingForType = !orphan;
    else if (orphan)
        orphan->deleteLater();
    return answer == QMessageBox::Yes;
}
