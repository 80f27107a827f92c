// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include <VelDesktopEntryPropsWidget.h>

#include "ActionListEdit.h"
#include "EntryFormAssistance.h"
#include "EntryTypeRules.h"
#include "FieldChoosers.h"
#include "FieldDialogSizes.h"
#include "UrlRow.h"
#include "VelDesktopEntryPropsWidgetPrivate.h"
#include "fields/IconEdit.h"
#include "fields/PathEdit.h"
#include "fields/StringListEdit.h"

#include <QCheckBox>
#include <QLineEdit>
#include <QRadioButton>
#include <QScrollArea>

using namespace VelUI;

namespace {

// A line that shows a list is never written in.
bool showsList(const QLineEdit *line)
{
    return qobject_cast<const StringListEdit *>(line->parentWidget())
        || qobject_cast<const ActionListEdit *>(line->parentWidget());
}

template <typename Edit>
void setAllReadOnly(const QWidget *content, bool readOnly)
{
    for (Edit *edit : content->findChildren<Edit *>())
        edit->setReadOnly(readOnly);
}

template <typename Button>
void setAllDisabled(const QWidget *content, bool disabled)
{
    for (Button *button : content->findChildren<Button *>())
        button->setDisabled(disabled);
}

} // namespace

VelDesktopEntryPropsWidget::VelDesktopEntryPropsWidget(QWidget *parent)
    : QWidget(parent)
    , d(std::make_unique<VelDesktopEntryPropsWidgetPrivate>(this))
{
    setType(EntryTypeRules::Application, {});
}

VelDesktopEntryPropsWidget::~VelDesktopEntryPropsWidget() = default;

bool VelDesktopEntryPropsWidget::assistance() const
{
    return d->assistance != nullptr;
}

void VelDesktopEntryPropsWidget::setAssistance(bool assistance)
{
    if (assistance == this->assistance())
        return;
    d->assistance = assistance ? std::make_unique<EntryFormAssistance>(*d) : nullptr;
    if (d->assistance) {
        new FieldChoosers(d->assistance.get());
        new FieldDialogSizes(d->assistance.get());
    }
}

void VelDesktopEntryPropsWidget::setType(const QString &type, const QStringList &allowedTypes)
{
    if (d->typeChooser.setType(type, allowedTypes))
        d->rows.showFor(type);
    d->tellRecordChange();
}

void VelDesktopEntryPropsWidget::loadFrom(const VelUIDesktopEntry &entry)
{
    d->load(entry);
    d->tellRecordChange();
}

void VelDesktopEntryPropsWidget::saveTo(VelUIDesktopEntry *entry)
{
    if (!entry)
        return;
    if (d->typeChooser.isDecided())
        entry->setType(d->typeChooser.type());
    d->rows.save(entry, d->typeChooser.type());
}

void VelDesktopEntryPropsWidget::setReadOnly(bool readOnly)
{
    if (readOnly == d->readOnly)
        return;
    d->readOnly = readOnly;
    d->typeChooser.setReadOnly(readOnly);
    const QWidget *const content = d->scrollArea->widget();
    for (QLineEdit *line : content->findChildren<QLineEdit *>()) {
        if (!showsList(line))
            line->setReadOnly(readOnly);
    }
    setAllReadOnly<IconEdit>(content, readOnly);
    setAllReadOnly<PathEdit>(content, readOnly);
    setAllReadOnly<StringListEdit>(content, readOnly);
    setAllReadOnly<ActionListEdit>(content, readOnly);
    setAllDisabled<QCheckBox>(content, readOnly);
    setAllDisabled<QRadioButton>(content, readOnly);
}

void VelDesktopEntryPropsWidget::setFrameStyle(int style)
{
    d->scrollArea->setFrameStyle(style);
}

void VelDesktopEntryPropsWidget::setShowURLInfoButton(bool show)
{
    d->rows.urlRow()->setInfoButtonWanted(show);
}
