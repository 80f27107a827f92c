// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuDrop.h"

#include "FileProgress.h"
#include "FolderOrder.h"
#include "FolderWatch.h"
#include "OnDisk.h"

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QFileSystemModel>
#include <QPointer>

#include <algorithm>

namespace {

QString failureText(const FileTransfer::Result &result, Qt::DropAction action)
{
    switch (result.failure) {
    case FileTransfer::Failure::None:
    case FileTransfer::Failure::Canceled: // which the user knows
        break;
    case FileTransfer::Failure::SourceGone:
        return QFileSystemModel::tr("%1 does not exist.").arg(result.path);
    case FileTransfer::Failure::TargetExists:
        return QFileSystemModel::tr("%1 exists and was left as it is.").arg(result.path);
    case FileTransfer::Failure::IntoItself:
        return QFileSystemModel::tr("%1 cannot be put into itself.").arg(result.path);
    case FileTransfer::Failure::NotWritable:
        return QFileSystemModel::tr("%1 cannot be written.").arg(result.path);
    case FileTransfer::Failure::Failed:
        return (action == Qt::MoveAction       ? QFileSystemModel::tr("Can't move %1: %2")
                    : action == Qt::LinkAction ? QFileSystemModel::tr("Can't link %1: %2")
                                               : QFileSystemModel::tr("Can't copy %1: %2"))
            .arg(result.path, result.reason);
    }
    return QString();
}

FileTransfer::Action transferAction(Qt::DropAction action)
{
    return action == Qt::MoveAction ? FileTransfer::Action::Move : FileTransfer::Action::Copy;
}

} // namespace

MenuDrop::MenuDrop(QFileSystemModel &model, FolderWatch &watch, MenuDropHost &host, const Request &request)
    : m_model(model)
    , m_watch(watch)
    , m_host(host)
    , m_request(request)
    , m_folder(model.filePath(request.folder))
{
    for (const QString &source : request.sources)
        m_targets.append(QDir(m_folder).filePath(QFileInfo(source).fileName()));
}

DropResult MenuDrop::carryOut()
{
    const QStringList &sources = m_request.sources;
    if (std::all_of(sources.begin(), sources.end(), [this](const QString &source) { return isHere(source); }))
        return reorder();
    if (m_model.isReadOnly())
        return {};
    if (!isHere(sources.constFirst()) && QFileInfo::exists(m_targets.constFirst()) && !confirm())
        return {};
    return bringIn();
}

bool MenuDrop::isHere(const QString &source) const
{
    return !source.isEmpty() && FileTransfer::liesIn(source, m_folder);
}

// What lies in the folder already only takes another place in its order. Where there is more that
// does not, the first does so along with it.
DropResult MenuDrop::reorder()
{
    // What is gone must not be listed.
    if (!OnDisk::exists(m_request.sources.constFirst()))
        return refused({FileTransfer::Failure::SourceGone, m_targets.constFirst(), QString()});
    m_host.begins(m_request.sources, m_targets, m_request.action, m_folder);
    std::optional<QStringList> order;
    if (m_request.action == Qt::MoveAction)
        order =
            m_host.orderWith(QFileInfo(m_targets.constFirst()).fileName(), m_request.row, m_request.folder);
    return done(true, write(order));
}

DropResult MenuDrop::bringIn()
{
    const FileTransfer::Result possible = FileTransfer::check(m_request.sources, m_folder);
    if (!possible.succeeded())
        return refused(possible);
    const bool isListed =
        isHere(m_request.sources.constFirst()) ? m_request.action == Qt::MoveAction : m_request.row != -1;
    std::optional<QStringList> order;
    if (isListed)
        order =
            m_host.orderWith(QFileInfo(m_targets.constFirst()).fileName(), m_request.row, m_request.folder);
    m_host.begins(m_request.sources, m_targets, m_request.action, m_folder);
    const QPointer<QFileSystemModel> model(&m_model);
    const FileTransfer::Result result = m_request.action == Qt::LinkAction ? link() : transfer();
    if (!model)
        return {};
    if (!result.succeeded())
        return refused(result);
    return done(isListed, write(order));
}

// Asks before a file that exists, and keeps the place that was meant when rows come and go.
bool MenuDrop::confirm()
{
    const int row = m_request.row;
    const bool isLast = row == m_model.rowCount(m_request.folder);
    const bool isBefore = row >= 0 && row < m_model.rowCount(m_request.folder);
    const QPersistentModelIndex following =
        isBefore ? m_model.index(row, 0, m_request.folder) : QModelIndex();
    const QPointer<QFileSystemModel> model(&m_model);
    if (!m_host.confirmOverwrite(m_targets.constFirst()) || !model || !m_request.folder.isValid())
        return false;
    if (row != -1)
        m_request.row = isLast ? m_model.rowCount(m_request.folder) : following.row();
    return true;
}

FileTransfer::Result MenuDrop::transfer()
{
    const QStringList released =
        m_request.action == Qt::MoveAction ? m_watch.release(m_request.sources) : QStringList();
    const QPointer<FolderWatch> watch(&m_watch);
    const std::unique_ptr<FileProgress> progress = m_host.follow(m_request.action);
    const FileTransfer::Result result =
        FileTransfer::transfer(m_request.sources, m_folder, transferAction(m_request.action), *progress);
    // What could not be moved is still there.
    if (watch)
        watch->watchAgain(released);
    return result;
}

// All or nothing, as with copies.
FileTransfer::Result MenuDrop::link()
{
    QStringList made;
    for (int i = 0; i < m_targets.size(); ++i) {
        QFile source(m_request.sources.at(i));
        if (isHere(source.fileName()))
            continue;
        if (source.link(m_targets.at(i))) {
            made.append(m_targets.at(i));
            continue;
        }
        for (const QString &link : qAsConst(made))
            QFile::remove(link);
        return {FileTransfer::Failure::Failed, source.fileName(), source.errorString()};
    }
    return {};
}

// A list that cannot be saved leaves the drop done; what the user is to hear of it.
QString MenuDrop::write(const std::optional<QStringList> &order) const
{
    return !order || FolderOrder::write(m_folder, *order) ? QString() : FolderOrder::notSaved(m_folder);
}

DropResult MenuDrop::done(bool sortAnew, const QString &complaint) const
{
    DropResult result;
    result.isDone = true;
    result.complaint = complaint;
    result.folder = m_request.folder;
    result.targets = m_targets;
    if (m_request.action == Qt::MoveAction)
        result.moved = m_request.sources;
    result.sortAnew = sortAnew;
    return result;
}

DropResult MenuDrop::refused(const FileTransfer::Result &result) const
{
    DropResult refusal;
    refusal.complaint = failureText(result, m_request.action);
    refusal.folder = m_request.folder;
    refusal.targets = m_targets;
    return refusal;
}
