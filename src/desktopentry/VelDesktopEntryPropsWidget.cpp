// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include <VelDesktopEntryPropsWidget.h>

#include "VelDesktopEntryPropsWidgetPrivate.h"

#include <QScrollArea>

VelDesktopEntryPropsWidget::VelDesktopEntryPropsWidget(QWidget *parent)
    : QWidget(parent)
    , d(new VelDesktopEntryPropsWidgetPrivate(this))
{
}

VelDesktopEntryPropsWidget::~VelDesktopEntryPropsWidget() = default;

void VelDesktopEntryPropsWidget::setType(const QString &type, const QStringList &allowedTypes)
{
    d->setType(type, allowedTypes);
}

void VelDesktopEntryPropsWidget::loadFrom(const VelUIDesktopEntry &entry)
{
    d->loadFrom(entry);
}

void VelDesktopEntryPropsWidget::saveTo(VelUIDesktopEntry *entry)
{
    d->saveTo(entry);
}

void VelDesktopEntryPropsWidget::setReadOnly(bool readOnly)
{
    d->setReadOnly(readOnly);
}

void VelDesktopEntryPropsWidget::setFrameStyle(int style)
{
    d->scrollArea->setFrameStyle(style);
}

void VelDesktopEntryPropsWidget::setShowURLInfoButton(bool show)
{
    d->setShowURLInfoButton(show);
}
