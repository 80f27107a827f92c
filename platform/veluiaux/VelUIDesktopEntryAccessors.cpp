// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// The getters and setters of the main group's keys, in the order of the header.

#include <veluiaux/VelUIDesktopEntry.h>

#include "VelUIDesktopEntryData.h"
#include "records/DesktopEntryNames.h"

#include <algorithm>

namespace Names = DesktopEntryNames;

namespace {

// Another text would end the name of the key, or the line.
bool canStandInKey(const QString &language)
{
    return !language.isEmpty() && std::all_of(language.begin(), language.end(), [](QChar character) {
        return character > QLatin1Char(' ') && character != QLatin1Char('[') && character != QLatin1Char(']')
            && character != QLatin1Char('=');
    });
}

} // namespace

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

QStringList VelUIDesktopEntry::getLanguages(const QString &key) const
{
    return d->document.languages(Names::MainGroup, key.toStdString());
}

QString VelUIDesktopEntry::getLanguageInForce(const QString &key) const
{
    return d->document.languageInForce(Names::MainGroup, key.toStdString());
}

QString VelUIDesktopEntry::getTranslation(const QString &key, const QString &language) const
{
    return d->document.text(Names::MainGroup, key.toStdString(), language.toStdString());
}

void VelUIDesktopEntry::setTranslation(const QString &key, const QString &language, const QString &value)
{
    if (canStandInKey(language))
        d->document.setText(Names::MainGroup, key.toStdString(), value, language.toStdString());
}

QStringList VelUIDesktopEntry::getTranslatedList(const QString &key, const QString &language) const
{
    return d->document.list(Names::MainGroup, key.toStdString(), language.toStdString());
}

void VelUIDesktopEntry::setTranslatedList(const QString &key, const QString &language,
                                          const QStringList &value)
{
    if (canStandInKey(language))
        d->document.setList(Names::MainGroup, key.toStdString(), value, language.toStdString());
}

QStringList VelUIDesktopEntry::getSortOrder() const
{
    return d->document.list(Names::MainGroup, Names::SortOrder);
}

void VelUIDesktopEntry::setSortOrder(const QStringList &value)
{
    d->document.setList(Names::MainGroup, Names::SortOrder, value);
}
