// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FileTransfer.h"

#include "FileProgress.h"
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

std::error_code transferOne(const Pair &pair, Action action, FileProgress &progress)
{
    if (!progress.goOn())
        return std::make_error_code(std::errc::operation_canceled);
    const TreeCopy::Path source = native(pair.source);
    const TreeCopy::Path target = native(pair.target);
    return action == Action::Move ? TreeCopy::move(source, target, progress)
                                  : TreeCopy::copy(source, target, progress);
}

// Counts what is to be done; why it is too much, if it is.
std::error_code count(const QString &source, Action action, FileProgress &progress)
{
    if (action == Action::Copy)
        return TreeLimits::check(native(source), progress);
    progress.expect(1);
    return {};
}

// Takes back what was done, the last first. What cannot be moved back stays whole where it is.
void takeBack(const QVector<Pair> &done, Action action, FileProgress &progress)
{
    UnstoppableProgress toTheEnd(progress);
    for (auto it = done.crbegin(); it != done.crend(); ++it) {
        if (action == Action::Copy)
            TreeRemoval::removeOwn(native(it->target), toTheEnd);
        else
            TreeCopy::move(native(it->target), native(it->source), toTheEnd);
    }
}

Result failed(const Pair &pair, const std::error_code &error)
{
    if (error == std::errc::file_exists)
        return {Failure::TargetExists, pair.target, QString()};
    if (error == std::errc::operation_canceled)
        return {Failure::Canceled, pair.source, QString()};
    return {Failure::Failed, pair.source, QString::fromLocal8Bit(error.message().c_str())};
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

Result transfer(const QStringList &sources, const QString &targetDirectory, Action action,
                FileProgress &progress)
{
    Result possible = check(sources, targetDirectory);
    if (!possible.succeeded())
        return possible;
    QVector<Pair> pairs;
    for (const QString &source : sources) {
        if (!liesIn(source, targetDirectory))
            pairs.append({source, targetOf(source, targetDirectory)});
    }
    for (const Pair &pair : qAsConst(pairs)) {
        if (const std::error_code error = count(pair.source, action, progress))
            return failed(pair, error);
    }
    StagingFolder::removeLeftovers(native(targetDirectory));
    for (auto pair = pairs.cbegin(); pair != pairs.cend(); ++pair) {
        if (const std::error_code error = transferOne(*pair, action, progress)) {
            takeBack(pairs.mid(0, int(pair - pairs.cbegin())), action, progress);
            return failed(*pair, error);
        }
    }
    return {};
}

Result transfer(const QStringList &sources, const QString &targetDirectory, Action action)
{
    FileProgress nobody;
    return transfer(sources, targetDirectory, action, nobody);
}

} // namespace FileTransfer
