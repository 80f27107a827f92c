// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include <veluiaux/VelUIDesktopEntry.h>

#include "EntryActions.h"
#include "EntryType.h"
#include "VelUIDesktopEntryData.h"
#include "records/DesktopEntryNames.h"
#include "records/EntryChecks.h"

#include <QFile>

namespace Names = DesktopEntryNames;

VelUIDesktopEntry::VelUIDesktopEntry(const QString &path)
    : d(new VelUIDesktopEntryData)
{
    if (path.isEmpty())
        return;
    d->document.setPath(QFile::encodeName(path));
    d->document.load();
}

VelUIDesktopEntry::VelUIDesktopEntry(const VelUIDesktopEntry &other) = default;
VelUIDesktopEntry::VelUIDesktopEntry(VelUIDesktopEntry &&other) noexcept = default;
VelUIDesktopEntry &VelUIDesktopEntry::operator=(const VelUIDesktopEntry &other) = default;
VelUIDesktopEntry &VelUIDesktopEntry::operator=(VelUIDesktopEntry &&other) noexcept = default;
VelUIDesktopEntry::~VelUIDesktopEntry() = default;

void VelUIDesktopEntry::setFilePath(const QString &path)
{
    d->document.setPath(QFile::encodeName(path));
}

bool VelUIDesktopEntry::load()
{
    return d->document.load();
}

bool VelUIDesktopEntry::save()
{
    return d->document.save();
}

QByteArray VelUIDesktopEntry::contents() const
{
    return d->document.contents();
}

bool VelUIDesktopEntry::isValid() const
{
    return d->document.isValid();
}

void VelUIDesktopEntry::inheritFrom(const VelUIDesktopEntry &other)
{
    // Keeps the other's data in place when that is this record itself.
    const VelUIDesktopEntry source(other);
    d->document.inheritFrom(source.d->document);
}

bool VelUIDesktopEntry::isSuitable(SuitableError *error) const
{
    const EntryChecks::Unsuitable reason = EntryChecks::suitability(d->document);
    if (error)
        *error = reason;
    return reason == EntryChecks::Suitable;
}

bool VelUIDesktopEntry::isDisplayable(DisplayableError *error) const
{
    const EntryChecks::NotDisplayed reason = EntryChecks::displayability(d->document);
    if (error)
        *error = reason;
    return reason == EntryChecks::Displayed;
}

QString VelUIDesktopEntry::getType() const
{
    return d->document.text(Names::MainGroup, Names::Type);
}

void VelUIDesktopEntry::setType(const QString &type)
{
    EntryType::set(d->document, type);
}

QList<VelUIDesktopAction> VelUIDesktopEntry::getActions() const
{
    return EntryActions::all(d->document);
}

void VelUIDesktopEntry::setActions(const QList<VelUIDesktopAction> &actions)
{
    EntryActions::set(d->document, actions);
}
