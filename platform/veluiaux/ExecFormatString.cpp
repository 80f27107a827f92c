// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include <veluiaux/VelUIDesktopEntry.h>

#include "records/ExecLine.h"

#include <QSharedData>

class VelUIExecFormatData : public QSharedData
{
public:
    QString exec;
    ExecLine::Arguments arguments;
};

using ExecFormatString = VelUIDesktopEntry::ExecFormatString;

ExecFormatString::ExecFormatString(const QString &exec)
    : d(new VelUIExecFormatData)
{
    d->exec = exec;
}

ExecFormatString::ExecFormatString(const ExecFormatString &other) = default;
ExecFormatString &ExecFormatString::operator=(const ExecFormatString &other) = default;
ExecFormatString::~ExecFormatString() = default;

ExecFormatString &ExecFormatString::filePath(const QString &path)
{
    d->arguments.filePath = path;
    return *this;
}

ExecFormatString &ExecFormatString::url(const QString &url)
{
    d->arguments.url = url;
    return *this;
}

ExecFormatString &ExecFormatString::appName(const QString &name)
{
    d->arguments.appName = name;
    return *this;
}

ExecFormatString &ExecFormatString::icon(const QString &icon)
{
    d->arguments.icon = icon;
    return *this;
}

ExecFormatString &ExecFormatString::desktopFilePath(const QString &path)
{
    d->arguments.desktopFilePath = path;
    return *this;
}

ExecFormatString &ExecFormatString::filePathList(const QStringList &paths)
{
    d->arguments.filePaths = paths;
    return *this;
}

ExecFormatString &ExecFormatString::urlList(const QStringList &urls)
{
    d->arguments.urls = urls;
    return *this;
}

ExecFormatString::operator QString() const
{
    return ExecLine::expand(d->exec, d->arguments);
}
