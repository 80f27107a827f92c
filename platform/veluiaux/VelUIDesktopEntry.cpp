// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include <veluiaux/VelUIDesktopEntry.h>

#include "EntryActions.h"
#include "EntryType.h"
#include "records/DesktopEntryNames.h"
#include "records/EntryChecks.h"
#include "records/EntryDocument.h"

#include <QFile>
#include <QSharedData>

namespace Names = DesktopEntryNames;

class VelUIDesktopEntryData : public QSharedData
{
public:
    EntryDocument document;
};

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

QString VelUIDesktopEntry::getName() const
{
    return d->document.text(Names::MainGroup, Names::Name);
}

void VelUIDesktopEntry::setName(const QString &value)
{
    d->document.setText(Names::MainGroup, Names::Name, value);
}

QString VelUIDesktopEntry::getLocalName() const
{
    return d->document.localText(Names::MainGroup, Names::Name);
}

void VelUIDesktopEntry::setLocalName(const QString &value)
{
    d->document.setLocalText(Names::MainGroup, Names::Name, value);
}

QString VelUIDesktopEntry::getGenericName() const
{
    return d->document.text(Names::MainGroup, Names::GenericName);
}

void VelUIDesktopEntry::setGenericName(const QString &value)
{
    d->document.setText(Names::MainGroup, Names::GenericName, value);
}

QString VelUIDesktopEntry::getLocalGenericName() const
{
    return d->document.localText(Names::MainGroup, Names::GenericName);
}

void VelUIDesktopEntry::setLocalGenericName(const QString &value)
{
    d->document.setLocalText(Names::MainGroup, Names::GenericName, value);
}

QString VelUIDesktopEntry::getComment() const
{
    return d->document.text(Names::MainGroup, Names::Comment);
}

void VelUIDesktopEntry::setComment(const QString &value)
{
    d->document.setText(Names::MainGroup, Names::Comment, value);
}

QString VelUIDesktopEntry::getLocalComment() const
{
    return d->document.localText(Names::MainGroup, Names::Comment);
}

void VelUIDesktopEntry::setLocalComment(const QString &value)
{
    d->document.setLocalText(Names::MainGroup, Names::Comment, value);
}

QString VelUIDesktopEntry::getIcon() const
{
    return d->document.text(Names::MainGroup, Names::Icon);
}

void VelUIDesktopEntry::setIcon(const QString &value)
{
    d->document.setText(Names::MainGroup, Names::Icon, value);
}

QString VelUIDesktopEntry::getLocalIcon() const
{
    return d->document.localText(Names::MainGroup, Names::Icon);
}

void VelUIDesktopEntry::setLocalIcon(const QString &value)
{
    d->document.setLocalText(Names::MainGroup, Names::Icon, value);
}

QString VelUIDesktopEntry::getExec() const
{
    return d->document.text(Names::MainGroup, Names::Exec);
}

void VelUIDesktopEntry::setExec(const QString &value)
{
    d->document.setText(Names::MainGroup, Names::Exec, value);
}

QString VelUIDesktopEntry::getTryExec() const
{
    return d->document.text(Names::MainGroup, Names::TryExec);
}

void VelUIDesktopEntry::setTryExec(const QString &value)
{
    d->document.setText(Names::MainGroup, Names::TryExec, value);
}

QString VelUIDesktopEntry::getPath() const
{
    return d->document.text(Names::MainGroup, Names::Path);
}

void VelUIDesktopEntry::setPath(const QString &value)
{
    d->document.setText(Names::MainGroup, Names::Path, value);
}

QString VelUIDesktopEntry::getURL() const
{
    return d->document.text(Names::MainGroup, Names::Url);
}

void VelUIDesktopEntry::setURL(const QString &value)
{
    d->document.setText(Names::MainGroup, Names::Url, value);
}

QString VelUIDesktopEntry::getStartupWMClass() const
{
    return d->document.text(Names::MainGroup, Names::StartupWMClass);
}

void VelUIDesktopEntry::setStartupWMClass(const QString &value)
{
    d->document.setText(Names::MainGroup, Names::StartupWMClass, value);
}

QString VelUIDesktopEntry::getVersion() const
{
    return d->document.text(Names::MainGroup, Names::Version);
}

void VelUIDesktopEntry::setVersion(const QString &value)
{
    d->document.setText(Names::MainGroup, Names::Version, value);
}

bool VelUIDesktopEntry::getTerminal() const
{
    return d->document.flag(Names::MainGroup, Names::Terminal);
}

void VelUIDesktopEntry::setTerminal(bool value)
{
    d->document.setFlag(Names::MainGroup, Names::Terminal, value);
}

bool VelUIDesktopEntry::getNoDisplay() const
{
    return d->document.flag(Names::MainGroup, Names::NoDisplay);
}

void VelUIDesktopEntry::setNoDisplay(bool value)
{
    d->document.setFlag(Names::MainGroup, Names::NoDisplay, value);
}

bool VelUIDesktopEntry::getHidden() const
{
    return d->document.flag(Names::MainGroup, Names::Hidden);
}

void VelUIDesktopEntry::setHidden(bool value)
{
    d->document.setFlag(Names::MainGroup, Names::Hidden, value);
}

bool VelUIDesktopEntry::getStartupNotify() const
{
    return d->document.flag(Names::MainGroup, Names::StartupNotify);
}

void VelUIDesktopEntry::setStartupNotify(bool value)
{
    d->document.setFlag(Names::MainGroup, Names::StartupNotify, value);
}

QStringList VelUIDesktopEntry::getOnlyShowIn() const
{
    return d->document.list(Names::MainGroup, Names::OnlyShowIn);
}

void VelUIDesktopEntry::setOnlyShowIn(const QStringList &value)
{
    d->document.setList(Names::MainGroup, Names::OnlyShowIn, value);
}

QStringList VelUIDesktopEntry::getNotShowIn() const
{
    return d->document.list(Names::MainGroup, Names::NotShowIn);
}

void VelUIDesktopEntry::setNotShowIn(const QStringList &value)
{
    d->document.setList(Names::MainGroup, Names::NotShowIn, value);
}

QStringList VelUIDesktopEntry::getMimeType() const
{
    return d->document.list(Names::MainGroup, Names::MimeType);
}

void VelUIDesktopEntry::setMimeType(const QStringList &value)
{
    d->document.setList(Names::MainGroup, Names::MimeType, value);
}

QStringList VelUIDesktopEntry::getCategories() const
{
    return d->document.list(Names::MainGroup, Names::Categories);
}

void VelUIDesktopEntry::setCategories(const QStringList &value)
{
    d->document.setList(Names::MainGroup, Names::Categories, value);
}

QStringList VelUIDesktopEntry::getKeywords() const
{
    return d->document.list(Names::MainGroup, Names::Keywords);
}

void VelUIDesktopEntry::setKeywords(const QStringList &value)
{
    d->document.setList(Names::MainGroup, Names::Keywords, value);
}

QStringList VelUIDesktopEntry::getLocalKeywords() const
{
    return d->document.localList(Names::MainGroup, Names::Keywords);
}

void VelUIDesktopEntry::setLocalKeywords(const QStringList &value)
{
    d->document.setLocalList(Names::MainGroup, Names::Keywords, value);
}

QStringList VelUIDesktopEntry::getSortOrder() const
{
    return d->document.list(Names::MainGroup, Names::SortOrder);
}

void VelUIDesktopEntry::setSortOrder(const QStringList &value)
{
    d->document.setList(Names::MainGroup, Names::SortOrder, value);
}

QList<VelUIDesktopAction> VelUIDesktopEntry::getActions() const
{
    return EntryActions::all(d->document);
}

void VelUIDesktopEntry::setActions(const QList<VelUIDesktopAction> &actions)
{
    EntryActions::set(d->document, actions);
}
