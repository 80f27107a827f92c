// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FileTransfer.h"

#include "OnDisk.h"
#include "StagingFolder.h"
#include "TreeCopy.h"
#include "TreeLimits.h"
#include "TreeRemoval.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QSet>
#include <QVector>

#include <cerrno>
#include <system_error>

#include <unistd.h>

namespace FileTransfer {

namespace {

struct Pair
{
    QString source;
    QString target;
};

TreeCopy::Path native(const QString &path)
{
    return TreeCopy::Path(QFile::encodeName(path).toStdString());
}

QString targetOf(const QString &source, const QString &directory)
{
    return QDir(directory).filePath(QFileInfo(source).fileName());
}

bool isBelow(const QString &path, const QString &folder)
{
    return path == folder || path.startsWith(folder + QLatin1Char('/'));
}

bool wouldContainItself(const QFileInfo &source, const QString &canonicalDirectory)
{
    return source.isDir() && !source.isSymLink() && isBelow(canonicalDirectory, source.canonicalFilePath());
}

std::error_code transferOne(const Pair &pair, Action action)
{
    const TreeCopy::Path source = native(pair.source);
    const TreeCopy::Path target = native(pair.target);
    if (action == Action::Move)
        return TreeCopy::move(source, target);
    const std::error_code error = TreeLimits::check(source);
    return error ? error : TreeCopy::copy(source, target);
}

// Takes back what was done, the last first. What cannot be moved back stays whole where it is.
void takeBack(const QVector<Pair> &done, Action action)
{
    for (auto it = done.crbegin(); it != done.crend(); ++it) {
        if (action == Action::Copy)
            TreeRemoval::removeOwn(native(it->target));
        else
            TreeCopy::move(native(it->target), native(it->source));
    }
}

Failure failureOf(const std::error_code &error)
{
    if (error == std::errc::file_exists)
        return Failure::TargetExists;
    return Failure::Failed;
}

} // namespace

bool liesIn(const QString &source, const QString &directory)
{
    const QString sourceDirectory = QFileInfo(source).absolutePath();
    if (sourceDirectory == QDir::cleanPath(directory))
        return true;
    const QString canonical = QFileInfo(sourceDirectory).canonicalFilePath();
    return !canonical.isEmpty() && canonical == QFileInfo(directory).canonicalFilePath();
}

Result check(const QStringList &sources, const QString &targetDirectory)
{
    const QString canonical = QFileInfo(targetDirectory).canonicalFilePath();
    if (canonical.isEmpty() || !QFileInfo(targetDirectory).isDir()
        || access(QFile::encodeName(targetDirectory).constData(), W_OK | X_OK) != 0)
        return {Failure::NotWritable, targetDirectory, QString()};

    QSet<QString> targets;
    for (const QString &source : sources) {
        const QFileInfo info(source);
        if (source.isEmpty() || !OnDisk::exists(source) || info.fileName().isEmpty())
            return {Failure::SourceGone, source, QString()};
        if (wouldContainItself(info, canonical))
            return {Failure::IntoItself, source, QString()};
        if (liesIn(source, targetDirectory))
            continue;
        const QString target = targetOf(source, targetDirectory);
        if (OnDisk::exists(target) || targets.contains(target))
            return {Failure::TargetExists, target, QString()};
        targets.insert(target);
    }
    return {};
}

Result transfer(const QStringList &sources, const QString &targetDirectory, Action action)
{
    Result possible = check(sources, targetDirectory);
    if (!possible.succeeded())
        return possible;
    StagingFolder::removeLeftovers(native(targetDirectory));
    QVector<Pair> done;
    for (const QString &source : sources) {
        if (liesIn(source, targetDirectory))
            continue;
        const Pair pair{source, targetOf(source, targetDirectory)};
        const std::error_code error = transferOne(pair, action);
        if (error) {
            takeBack(done, action);
            const Failure failure = failureOf(error);
            return {failure, failure == Failure::TargetExists ? pair.target : source,
                    QString::fromLocal8Bit(error.message().c_str())};
        }
        done.append(pair);
    }
    return {};
}

} // namespace FileTransfer
