// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include <VelDesktopEntryPropsWidget.h>

#include "EntryFormAssistance.h"
#include "EntryTypeRules.h"
#include "FieldChoosers.h"
#include "FieldDialogs.h"
#include "FormFindings.h"
#include "UrlRow.h"
#include "VelDesktopEntryPropsWidgetPrivate.h"

#include <QScrollArea>

using namespace VelUI;

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
        const auto place = [assistance = d->assistance.get()](const FormRow &row, QWidget *button) {
            assistance->addBeside(row, button);
        };
        new FieldChoosers(d->assistance->rows(), place, d->assistance.get());
        new FieldDialogs(d->assistance.get());
        new FormFindings(d->assistance.get(),
                         {this, [this] { return d->path; }, [this] { return d->readOnly; }});
    }
}

void VelDesktopEntryPropsWidget::setType(const QString &type, const QStringList &allowedTypes)
{
    if (d->typeChooser.setType(type, allowedTypes))
        d->rows.showFor(type);
    if (d->isLoading)
        return;
    if (!d->isCopying)
        Q_EMIT d->typeSet();
    Q_EMIT d->recordChanged();
}

void VelDesktopEntryPropsWidget::setType(const QString &type)
{
    setType(type, d->typeChooser.allowedTypes());
}

QString VelDesktopEntryPropsWidget::type() const
{
    return d->typeChooser.type();
}

void VelDesktopEntryPropsWidget::loadFrom(const VelUIDesktopEntry &entry)
{
    d->load(entry);
    if (!d->isCopying)
        Q_EMIT d->entryLoaded();
    d->tellRecordChange();
}

void VelDesktopEntryPropsWidget::saveTo(VelUIDesktopEntry *entry)
{
    if (entry)
        d->save(entry);
}

void VelDesktopEntryPropsWidget::setReadOnly(bool readOnly)
{
    if (readOnly == d->readOnly)
        return;
    d->readOnly = readOnly;
    d->applyReadOnly();
    d->tellRecordChange();
}

bool VelDesktopEntryPropsWidget::isReadOnly() const
{
    return d->readOnly;
}

void VelDesktopEntryPropsWidget::setFrameStyle(int style)
{
    d->scrollArea->setFrameStyle(style);
}

void VelDesktopEntryPropsWidget::setShowURLInfoButton(bool show)
{
    d->rows.urlRow()->setInfoButtonWanted(show);
}

bool VelDesktopEntryPropsWidget::showURLInfoButton() const
{
    return d->rows.urlRow()->isInfoButtonWanted();
}
