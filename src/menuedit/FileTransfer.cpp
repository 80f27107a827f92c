// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FileTransfer.h"

#include "FileProgress.h"
#include "OnDisk.h"
#include "StagedCopies.h"
#include "StagingFolder.h"
#include "TreeCopy.h"
#include "TreeLimits.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QSet>
#include <QVector>

#include <algorithm>
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

// Counts what is to be done; why it is too much, if it is.
std::error_code count(const QString &source, Action action, FileProgress &progress)
{
    if (action == Action::Copy)
        return TreeLimits::check(native(source), progress);
    progress.expect(1);
    return {};
}

Result failed(const Pair &pair, const std::error_code &error)
{
    if (error == std::errc::file_exists)
        return {Failure::TargetExists, pair.target, QString()};
    if (error == std::errc::operation_canceled)
        return {Failure::Canceled, pair.source, QString()};
    return {Failure::Failed, pair.source, QString::fromLocal8Bit(error.message().c_str())};
}

// One transfer: what can be moved in one step is at once, all else appears together in the end.
class Transfer
{
public:
    Transfer(Action action, FileProgress &progress)
        : m_action(action)
        , m_progress(progress)
        , m_copies(action == Action::Move ? FileCopy::Kind::Move : FileCopy::Kind::Copy, progress)
    {
    }

    Result carryOut(const QVector<Pair> &pairs)
    {
        for (const Pair &pair : pairs) {
            if (const std::error_code error = transfer(pair))
                return takeBack(pair, error);
        }
        const std::error_code error = m_copies.reveal();
        if (!error)
            return {};
        const auto isFailed = [this](const Pair &pair) { return native(pair.source) == m_copies.failed(); };
        return takeBack(*std::find_if(pairs.begin(), pairs.end(), isFailed), error);
    }

private:
    std::error_code transfer(const Pair &pair)
    {
        if (!m_progress.goOn())
            return std::make_error_code(std::errc::operation_canceled);
        if (m_action == Action::Move) {
            const std::error_code error =
                TreeCopy::moveAtOnce(native(pair.source), native(pair.target), m_progress);
            if (!error)
                m_moved.append(pair);
            if (error != std::errc::cross_device_link)
                return error;
        }
        return m_copies.add(native(pair.source), native(pair.target));
    }

    // The last first. What cannot be moved back stays whole where it is.
    Result takeBack(const Pair &pair, const std::error_code &error)
    {
        UnstoppableProgress toTheEnd(m_progress);
        for (auto it = m_moved.crbegin(); it != m_moved.crend(); ++it)
            TreeCopy::move(native(it->target), native(it->source), toTheEnd);
        return failed(pair, error);
    }

    const Action m_action;
    FileProgress &m_progress;
    StagedCopies m_copies;
    QVector<Pair> m_moved;
};

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
    return Transfer(action, progress).carryOut(pairs);
}

Result transfer(const QStringList &sources, const QString &targetDirectory, Action action)
{
    FileProgress nobody;
    return transfer(sources, targetDirectory, action, nobody);
}

} // namespace FileTransfer
