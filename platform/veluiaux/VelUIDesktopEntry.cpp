// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include <veluiaux/VelUIDesktopEntry.h>

#include <QSharedData>

class VelUIDesktopEntryData : public QSharedData
{
};

VelUIDesktopEntry::ExecFormatString::ExecFormatString(const QString &exec)
    : m_exec(exec)
{
}
VelUIDesktopEntry::ExecFormatString &VelUIDesktopEntry::ExecFormatString::filePath(const QString &)
{
    return *this;
}
VelUIDesktopEntry::ExecFormatString &VelUIDesktopEntry::ExecFormatString::url(const QString &)
{
    return *this;
}
VelUIDesktopEntry::ExecFormatString &VelUIDesktopEntry::ExecFormatString::appName(const QString &)
{
    return *this;
}
VelUIDesktopEntry::ExecFormatString &VelUIDesktopEntry::ExecFormatString::icon(const QString &)
{
    return *this;
}
VelUIDesktopEntry::ExecFormatString &VelUIDesktopEntry::ExecFormatString::desktopFilePath(const QString &)
{
    return *this;
}
VelUIDesktopEntry::ExecFormatString &VelUIDesktopEntry::ExecFormatString::filePathList(const QStringList &)
{
    return *this;
}
VelUIDesktopEntry::ExecFormatString &VelUIDesktopEntry::ExecFormatString::urlList(const QStringList &)
{
    return *this;
}
VelUIDesktopEntry::ExecFormatString::operator QString() const
{
    return m_exec;
}

VelUIDesktopEntry::VelUIDesktopEntry(const QString &) { }
VelUIDesktopEntry::VelUIDesktopEntry(const VelUIDesktopEntry &other) = default;
VelUIDesktopEntry::VelUIDesktopEntry(VelUIDesktopEntry &&other) noexcept = default;
VelUIDesktopEntry &VelUIDesktopEntry::operator=(const VelUIDesktopEntry &other) = default;
VelUIDesktopEntry &VelUIDesktopEntry::operator=(VelUIDesktopEntry &&other) noexcept = default;
VelUIDesktopEntry::~VelUIDesktopEntry() = default;
void VelUIDesktopEntry::setFilePath(const QString &) { }
bool VelUIDesktopEntry::load()
{
    return false;
}
bool VelUIDesktopEntry::save()
{
    return false;
}
bool VelUIDesktopEntry::isValid() const
{
    return false;
}
void VelUIDesktopEntry::inheritFrom(const VelUIDesktopEntry &) { }
bool VelUIDesktopEntry::isSuitable(SuitableError *) const
{
    return false;
}
bool VelUIDesktopEntry::isDisplayable(DisplayableError *) const
{
    return false;
}
QString VelUIDesktopEntry::getType() const
{
    return {};
}
void VelUIDesktopEntry::setType(const QString &) { }
QString VelUIDesktopEntry::getName() const
{
    return {};
}
void VelUIDesktopEntry::setName(const QString &) { }
QString VelUIDesktopEntry::getLocalName() const
{
    return {};
}
void VelUIDesktopEntry::setLocalName(const QString &) { }
QString VelUIDesktopEntry::getGenericName() const
{
    return {};
}
void VelUIDesktopEntry::setGenericName(const QString &) { }
QString VelUIDesktopEntry::getLocalGenericName() const
{
    return {};
}
void VelUIDesktopEntry::setLocalGenericName(const QString &) { }
QString VelUIDesktopEntry::getComment() const
{
    return {};
}
void VelUIDesktopEntry::setComment(const QString &) { }
QString VelUIDesktopEntry::getLocalComment() const
{
    return {};
}
void VelUIDesktopEntry::setLocalComment(const QString &) { }
QString VelUIDesktopEntry::getIcon() const
{
    return {};
}
void VelUIDesktopEntry::setIcon(const QString &) { }
QString VelUIDesktopEntry::getLocalIcon() const
{
    return {};
}
void VelUIDesktopEntry::setLocalIcon(const QString &) { }
QString VelUIDesktopEntry::getExec() const
{
    return {};
}
void VelUIDesktopEntry::setExec(const QString &) { }
QString VelUIDesktopEntry::getTryExec() const
{
    return {};
}
void VelUIDesktopEntry::setTryExec(const QString &) { }
QString VelUIDesktopEntry::getPath() const
{
    return {};
}
void VelUIDesktopEntry::setPath(const QString &) { }
QString VelUIDesktopEntry::getURL() const
{
    return {};
}
void VelUIDesktopEntry::setURL(const QString &) { }
QString VelUIDesktopEntry::getStartupWMClass() const
{
    return {};
}
void VelUIDesktopEntry::setStartupWMClass(const QString &) { }
QString VelUIDesktopEntry::getVersion() const
{
    return {};
}
void VelUIDesktopEntry::setVersion(const QString &) { }
bool VelUIDesktopEntry::getTerminal() const
{
    return false;
}
void VelUIDesktopEntry::setTerminal(bool) { }
bool VelUIDesktopEntry::getNoDisplay() const
{
    return false;
}
void VelUIDesktopEntry::setNoDisplay(bool) { }
bool VelUIDesktopEntry::getHidden() const
{
    return false;
}
void VelUIDesktopEntry::setHidden(bool) { }
bool VelUIDesktopEntry::getStartupNotify() const
{
    return false;
}
void VelUIDesktopEntry::setStartupNotify(bool) { }
QStringList VelUIDesktopEntry::getOnlyShowIn() const
{
    return {};
}
void VelUIDesktopEntry::setOnlyShowIn(const QStringList &) { }
QStringList VelUIDesktopEntry::getNotShowIn() const
{
    return {};
}
void VelUIDesktopEntry::setNotShowIn(const QStringList &) { }
QStringList VelUIDesktopEntry::getMimeType() const
{
    return {};
}
void VelUIDesktopEntry::setMimeType(const QStringList &) { }
QStringList VelUIDesktopEntry::getCategories() const
{
    return {};
}
void VelUIDesktopEntry::setCategories(const QStringList &) { }
QStringList VelUIDesktopEntry::getKeywords() const
{
    return {};
}
void VelUIDesktopEntry::setKeywords(const QStringList &) { }
QStringList VelUIDesktopEntry::getLocalKeywords() const
{
    return {};
}
void VelUIDesktopEntry::setLocalKeywords(const QStringList &) { }
QStringList VelUIDesktopEntry::getSortOrder() const
{
    return {};
}
void VelUIDesktopEntry::setSortOrder(const QStringList &) { }
QList<VelUIDesktopAction> VelUIDesktopEntry::getActions() const
{
    return {};
}
void VelUIDesktopEntry::setActions(const QList<VelUIDesktopAction> &) { }
