// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuDrop.h"

#include "FileLinks.h"
#include "FileProgress.h"
#include "FolderOrder.h"
#include "FolderWatch.h"
#include "KeptThing.h"
#include "MeantRow.h"
#include "OnDisk.h"
#include "Refusal.h"
#include "ReplacedThings.h"
#include "TransferText.h"

#include <QCoreApplication>
#include <QFile>
#include <QFileInfo>
#include <QFileSystemModel>
#include <QPointer>

#include <algorithm>

namespace {

FileTransfer::Action transferAction(Qt::DropAction action)
{
    return action == Qt::MoveAction ? FileTransfer::Action::Move : FileTransfer::Action::Copy;
}

QString notSaved(const QString &path, const QString &folder)
{
    return QCoreApplication::translate("VelMenuView",
                                       "%1 could not be saved. Make sure that the folder %2 may be written "
                                       "and that the disk is not full, then try again.")
        .arg(path, folder);
}

void removeAll(const QStringList &files)
{
    for (const QString &file : files)
        QFile::remove(file);
}

} // namespace

MenuDrop::MenuDrop(QFileSystemModel &model, FolderWatch &watch, MenuDropHost &host, const Request &request)
    : m_model(model)
    , m_watch(watch)
    , m_host(host)
    , m_request(request)
    , m_folder(model.filePath(request.folder))
    , m_targets(m_folder, request.sources, request.addresses)
    , m_items(m_targets.plain())
{
}

DropResult MenuDrop::carryOut()
{
    if (areAllHere())
        return reorder();
    if (m_model.isReadOnly())
        return {};
    if (m_request.isAssisted) {
        // Nobody is asked about what cannot be done whatever the answer.
        m_items = m_targets.besides();
        const FileTransfer::Result possible = check();
        if (!possible.succeeded())
            return refused(possible);
    }
    if (!settle() || m_items.isEmpty())
        return {};
    return areAllHere() ? reorder() : bringIn();
}

bool MenuDrop::areAllHere() const
{
    return std::all_of(m_items.begin(), m_items.end(), [](const DropItem &item) { return item.isHere; });
}

// Has the user asked where names are taken, and keeps the place that was meant when rows come and go.
bool MenuDrop::settle()
{
    const MeantRow row(m_model, m_request.row, m_request.folder);
    if (!(m_request.isAssisted ? settleAll() : settleFirst()))
        return false;
    m_request.row = row.in(m_model, m_request.folder);
    return true;
}

bool MenuDrop::settleFirst()
{
    const DropItem &first = m_items.constFirst();
    if (first.isHere || !QFileInfo::exists(first.target))
        return true;
    const QPointer<QFileSystemModel> model(&m_model);
    return m_host.confirmOverwrite(first.target) && model && m_request.folder.isValid();
}

bool MenuDrop::settleAll()
{
    const QPointer<QFileSystemModel> model(&m_model);
    const std::optional<QVector<DropItem>> items = m_targets.settled([&](const NameClash &clash) {
        const NameClash::Answer answer = m_host.askAbout(clash);
        return model && m_request.folder.isValid() ? answer : NameClash::Answer();
    });
    m_items = items.value_or(QVector<DropItem>());
    return items.has_value();
}

// What lies in the folder already only takes another place in its order. Where there is more that
// does not, it does so along with it.
DropResult MenuDrop::reorder()
{
    // What is gone must not be listed.
    for (const DropItem &item : m_request.isAssisted ? m_items : m_items.mid(0, 1)) {
        if (!OnDisk::exists(item.source))
            return refused({FileTransfer::Failure::SourceGone, item.target, QString()});
    }
    m_host.begins(m_items, m_request.action, m_folder);
    return done(true, write(order()));
}

DropResult MenuDrop::bringIn()
{
    const FileTransfer::Result possible = check();
    if (!possible.succeeded())
        return refused(possible);
    const std::optional<QStringList> list = order();
    const QPointer<QFileSystemModel> model(&m_model);
    const QPointer<FolderWatch> watch(&m_watch);
    const QStringList released = m_watch.release(leavingPaths());
    const std::optional<DropResult> refusal = carryOver();
    // What could not be moved is still there.
    if (watch)
        watch->watchAgain(released);
    if (!model)
        return {};
    return refusal ? *refusal : done(isListed(), write(list));
}

// What made room is back when this does not succeed.
std::optional<DropResult> MenuDrop::carryOver()
{
    ReplacedThings replaced;
    QString occupied;
    if (!makeRoom(replaced, &occupied))
        return refused(Refusal::notTrashed(occupied).reason);
    m_host.begins(m_items, m_request.action, m_folder);
    QStringList written;
    if (const QString failed = writeEntries(&written); !failed.isEmpty()) {
        removeAll(written);
        return refused(notSaved(failed, m_folder));
    }
    const QPointer<QFileSystemModel> model(&m_model);
    const FileTransfer::Result result = transfer();
    if (!result.succeeded()) {
        removeAll(written);
        return refused(result);
    }
    std::vector<ReplacedThings::Thing> things = replaced.take();
    for (ReplacedThings::Thing &thing : things) {
        if (model)
            m_host.replaced(thing.path, std::move(thing.kept));
    }
    return std::nullopt;
}

// What is to be replaced is still there, and looked at when it has made room.
FileTransfer::Result MenuDrop::check() const
{
    QVector<FileTransfer::Item> items;
    for (const DropItem &item : m_items) {
        if (item.isFile() && !item.isReplacing)
            items.append({item.source, item.target});
    }
    const FileTransfer::Result folder = FileTransfer::check(QStringList(), m_folder);
    return folder.succeeded() ? FileTransfer::check(items) : folder;
}

bool MenuDrop::makeRoom(ReplacedThings &replaced, QString *occupied) const
{
    for (const DropItem &item : m_items) {
        *occupied = item.target;
        if (item.isReplacing && !replaced.putAway(item.target))
            return false;
    }
    return true;
}

// The path that could not be written, if there is one.
QString MenuDrop::writeEntries(QStringList *made) const
{
    for (const DropItem &item : m_items) {
        if (item.isFile())
            continue;
        if (!item.address.save(item.target))
            return item.target;
        made->append(item.target);
    }
    return QString();
}

FileTransfer::Result MenuDrop::transfer()
{
    const bool isLink = m_request.action == Qt::LinkAction;
    QVector<FileTransfer::Item> items;
    for (const DropItem &item : qAsConst(m_items)) {
        if (item.isFile() && !(isLink && item.isHere))
            items.append({item.source, item.target});
    }
    if (isLink)
        return FileLinks::make(items);
    const std::unique_ptr<FileProgress> progress = m_host.follow(m_request.action);
    return FileTransfer::transfer(items, transferAction(m_request.action), *progress);
}

// The folders among them are not to be watched meanwhile.
QStringList MenuDrop::leavingPaths() const
{
    QStringList paths;
    for (const DropItem &item : m_items) {
        if (m_request.action == Qt::MoveAction && item.isFile())
            paths.append(item.source);
        if (item.isReplacing)
            paths.append(item.target);
    }
    return paths;
}

bool MenuDrop::isListed() const
{
    const bool isMove = m_request.action == Qt::MoveAction;
    if (!m_request.isAssisted)
        return m_items.constFirst().isHere ? isMove : m_request.row != -1;
    const bool isAnyHere =
        std::any_of(m_items.begin(), m_items.end(), [](const DropItem &item) { return item.isHere; });
    return m_request.row != -1 ? isMove || !areAllHere() : isMove && isAnyHere;
}

std::optional<QStringList> MenuDrop::order() const
{
    if (!isListed())
        return std::nullopt;
    QStringList names;
    for (const DropItem &item : m_request.isAssisted ? m_items : m_items.mid(0, 1)) {
        // A copy of what is here leaves it where it is.
        if (m_request.action == Qt::MoveAction || !item.isHere)
            names.append(QFileInfo(item.target).fileName());
    }
    return m_host.orderWith(names, m_request.row, m_request.folder);
}

// A list that cannot be saved leaves the drop done; what the user is to hear of it.
QString MenuDrop::write(const std::optional<QStringList> &order) const
{
    return !order || FolderOrder::write(m_folder, *order) ? QString() : FolderOrder::notSaved(m_folder);
}

DropResult MenuDrop::result() const
{
    DropResult result;
    result.folder = m_request.folder;
    for (const DropItem &item : m_items)
        result.targets.append(item.target);
    return result;
}

DropResult MenuDrop::done(bool sortAnew, const QString &complaint) const
{
    DropResult result = this->result();
    result.isDone = true;
    result.complaint = complaint;
    if (m_request.action == Qt::MoveAction) {
        for (const DropItem &item : m_items) {
            if (item.isFile())
                result.moved.append(item.source);
        }
    }
    result.sortAnew = sortAnew;
    return result;
}

DropResult MenuDrop::refused(const QString &complaint) const
{
    DropResult refusal = result();
    refusal.complaint = complaint;
    return refusal;
}

DropResult MenuDrop::refused(const FileTransfer::Result &failure) const
{
    return refused(TransferText::of(failure, m_request.action));
}
