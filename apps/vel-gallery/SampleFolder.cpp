// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "SampleFolder.h"

#include <QDir>
#include <QDirIterator>
#include <QFile>
#include <QFileInfo>

namespace {

// Not QFile::copy(), which would hand on that a resource is read-only.
void copyFile(const QString &from, const QString &to)
{
    QDir().mkpath(QFileInfo(to).path());
    QFile source(from);
    QFile target(to);
    if (source.open(QIODevice::ReadOnly) && target.open(QIODevice::WriteOnly))
        target.write(source.readAll());
}

} // namespace

SampleFolder::SampleFolder(const QString &name)
{
    Q_INIT_RESOURCE(samples); // a static library's resources are not there by themselves
    const QDir samples(QStringLiteral(":/vel-gallery/samples/") + name);
    QDirIterator files(samples.path(), QDir::Files | QDir::Hidden, QDirIterator::Subdirectories);
    while (files.hasNext()) {
        const QString sample = files.next();
        copyFile(sample, filePath(samples.relativeFilePath(sample)));
    }
}

QString SampleFolder::path() const
{
    return m_folder.path();
}

QString SampleFolder::filePath(const QString &name) const
{
    return m_folder.filePath(name);
}
