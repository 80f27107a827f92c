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

TreeCopy::Path native(const QString &path)
{
    return TreeCopy::Path(QFile::encodeName(path).toStdString());
}

QString folderOf(const QString &path)
{
    return QFileInfo(path).path();
}

bool isInPlace(const Item &item)
{
    return QFileInfo(item.source).fileName() == QFileInfo(item.target).fileName()
        && liesIn(item.source, folderOf(item.target));
}

bool isWritable(const QString &directory)
{
    return QFileInfo(directory).isDir() && access(QFile::encodeName(directory).constData(), W_OK | X_OK) == 0;
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

Result failed(const Item &item, const std::error_code &error)
{
    if (error == std::errc::file_exists)
        return {Failure::TargetExists, item.target, QString()};
    if (error == std::errc::operation_canceled)
        return {Failure::Canceled, item.source, QString()};
    return {Failure::Failed, item.source, QString::fromLocal8Bit(error.message().c_str())};
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

    Result carryOut(const QVector<Item> &items)
    {
        for (const Item &item : items) {
            if (const std::error_code error = transfer(item))
                return takeBack(item, error);
        }
        const std::error_code error = m_copies.reveal();
        if (!error)
            return {};
        const auto isFailed = [this](const Item &item) { return native(item.source) == m_copies.failed(); };
        return takeBack(*std::find_if(items.begin(), items.end(), isFailed), error);
    }

private:
    std::error_code transfer(const Item &item)
    {
        if (!m_progress.goOn())
            return std::make_error_code(std::errc::operation_canceled);
        if (m_action == Action::Move) {
            const std::error_code error =
                TreeCopy::moveAtOnce(native(item.source), native(item.target), m_progress);
            if (!error)
                m_moved.append(item);
            if (error != std::errc::cross_device_link)
                return error;
        }
        return m_copies.add(native(item.source), native(item.target));
    }

    // The last first. What cannot be moved back stays whole where it is.
    Result takeBack(const Item &item, const std::error_code &error)
    {
        UnstoppableProgress toTheEnd(m_progress);
        for (auto it = m_moved.crbegin(); it != m_moved.crend(); ++it)
            TreeCopy::move(native(it->target), native(it->source), toTheEnd);
        return failed(item, error);
    }

    const Action m_action;
    FileProgress &m_progress;
    StagedCopies m_copies;
    QVector<Item> m_moved;
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

QVector<Item> itemsFor(const QStringList &sources, const QString &targetDirectory)
{
    QVector<Item> items;
    for (const QString &source : sources)
        items.append({source, QDir(targetDirectory).filePath(QFileInfo(source).fileName())});
    return items;
}

Result check(const QVector<Item> &items)
{
    QSet<QString> targets;
    for (const Item &item : items) {
        const QString folder = folderOf(item.target);
        const QFileInfo info(item.source);
        if (!isWritable(folder))
            return {Failure::NotWritable, folder, QString()};
        if (item.source.isEmpty() || !OnDisk::exists(item.source) || info.fileName().isEmpty())
            return {Failure::SourceGone, item.source, QString()};
        if (wouldContainItself(info, QFileInfo(folder).canonicalFilePath()))
            return {Failure::IntoItself, item.source, QString()};
        if (isInPlace(item))
            continue;
        if (OnDisk::exists(item.target) || targets.contains(item.target))
            return {Failure::TargetExists, item.target, QString()};
        targets.insert(item.target);
    }
    return {};
}

Result check(const QStringList &sources, const QString &targetDirectory)
{
    if (!isWritable(targetDirectory))
        return {Failure::NotWritable, targetDirectory, QString()};
    return check(itemsFor(sources, targetDirectory));
}

Result transfer(const QVector<Item> &items, Action action, FileProgress &progress)
{
    Result possible = check(items);
    if (!possible.succeeded())
        return possible;
    QVector<Item> wanted;
    QSet<QString> folders;
    for (const Item &item : items) {
        if (isInPlace(item))
            continue;
        wanted.append(item);
        folders.insert(folderOf(item.target));
    }
    for (const Item &item : qAsConst(wanted)) {
        if (const std::error_code error = count(item.source, action, progress))
            return failed(item, error);
    }
    for (const QString &folder : qAsConst(folders))
        StagingFolder::removeLeftovers(native(folder));
    return Transfer(action, progress).carryOut(wanted);
}

Result transfer(const QStringList &sources, const QString &targetDirectory, Action action,
                FileProgress &progress)
{
    if (!isWritable(targetDirectory))
        return {Failure::NotWritable, targetDirectory, QString()};
    return transfer(itemsFor(sources, targetDirectory), action, progress);
}

Result transfer(const QStringList &sources, const QString &targetDirectory, Action action)
{
    FileProgress nobody;
    return transfer(sources, targetDirectory, action, nobody);
}

} // namespace FileTransfer
