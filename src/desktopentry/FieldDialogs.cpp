// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FieldDialogs.h"

#include "ActionChoosers.h"
#include "ActionListEdit.h"
#include "ActionPropsDialog.h"
#include "EditActionsDialog.h"
#include "EditActionsWidget.h"
#include "EntryFormAssistance.h"
#include "fields/EditStringsDialog.h"
#include "fields/StringListEdit.h"

#include <frame/DialogSize.h>

#include <QChildEvent>
#include <QDialog>

namespace VelUI {

namespace {

// Each kind of dialog has its size.
QString sizeGroup(const QDialog &dialog)
{
    return QString::fromLatin1(dialog.metaObject()->className()).section(QStringLiteral("::"), -1);
}

bool isRemembered(const QDialog &dialog)
{
    return qobject_cast<const EditStringsDialog *>(&dialog)
        || qobject_cast<const EditActionsDialog *>(&dialog)
        || qobject_cast<const ActionPropsDialog *>(&dialog);
}

} // namespace

FieldDialogs::FieldDialogs(EntryFormAssistance *assistance)
    : QObject(assistance)
{
    for (const FormRow &row : assistance->rows())
        watchField(row.field);
    // Another language brings fields of its own.
    assistance->rows().constFirst().field->parentWidget()->installEventFilter(this);
}

void FieldDialogs::watchField(QObject *field)
{
    if (qobject_cast<StringListEdit *>(field) || qobject_cast<ActionListEdit *>(field))
        field->installEventFilter(this);
}

void FieldDialogs::watch(QDialog *dialog)
{
    dialog->installEventFilter(this);
    if (auto *action = qobject_cast<ActionPropsDialog *>(dialog))
        ActionChoosers::addTo(action);
    // It opens the dialog of one action.
    if (auto *list = dialog->findChild<EditActionsWidget *>())
        list->installEventFilter(this);
}

bool FieldDialogs::eventFilter(QObject *watched, QEvent *event)
{
    if (event->type() == QEvent::ChildPolished) {
        // Before it is shown first.
        QObject *const child = static_cast<QChildEvent *>(event)->child();
        auto *dialog = qobject_cast<QDialog *>(child);
        if (dialog && isRemembered(*dialog))
            watch(dialog);
        else
            watchField(child);
    } else if (auto *dialog = qobject_cast<QDialog *>(watched)) {
        if (event->type() == QEvent::Show && !event->spontaneous())
            DialogSize::restoreShown(*dialog, sizeGroup(*dialog));
        else if (event->type() == QEvent::Hide && !event->spontaneous())
            DialogSize::remember(*dialog, sizeGroup(*dialog));
    }
    return QObject::eventFilter(watched, event);
}

} // namespace VelUI
