// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EntryDisplay.h"
#include "FolderOrder.h"
#include "FreeName.h"
#include "ShownOrder.h"
#include "VelDesktopEntryEditDialog.h"
#include "VelMenuModel.h"
#include "VelMenuProxyModel.h"
#include "VelMenuView.h"
#include "VelMenuViewPrivate.h"

#include <frame/DesktopEntryRecord.h>
#include <frame/EntryPath.h>
#include <frame/GuardedDialog.h>
#include <frame/MessageBox.h>

#include <QDir>
#include <QFileInfo>
#include <QPointer>

#include <algorithm>

bool VelMenuView::fixSortOrderForNew(const QString &name, int row, const QModelIndex &folder)
{
    const QString path = folder.isValid() ? d->model->filePath(folder) : QString();
    if (path.isEmpty())
        return false;
    FolderOrder::write(path, ShownOrder::with(*d->proxy, name, row, folder));
    d->model->noteRecordFile(path);
    return true;
}

void VelMenuView::fixSortOrderInDir(const QModelIndex &item, bool up)
{
    if (!item.isValid())
        return;
    const QModelIndex shown = d->proxy->mapFromSource(item);
    const QModelIndex folder = shown.parent();
    const QModelIndex sourceFolder = item.parent();
    const int target = up ? shown.row() - 1 : shown.row() + 2;
    int row = d->model->rowCount(sourceFolder);
    if (target < d->proxy->rowCount(folder))
        row = d->proxy->mapToSource(d->proxy->index(std::max(target, 0), 0, folder)).row();
    fixSortOrderForNew(item.data(QFileSystemModel::FileNameRole).toString(), row, sourceFolder);
    invalidateSortOrder(sourceFolder);
}

void VelMenuViewPrivate::moveSelected(bool up)
{
    const QModelIndex item = q->selectedItem();
    if (!item.isValid())
        return;
    q->fixSortOrderInDir(item, up);
    q->clearFindResults();
    q->setActionsEnabled();
    Q_EMIT q->changed();
}

void VelMenuView::slotUp()
{
    d->moveSelected(true);
}

void VelMenuView::slotDown()
{
    d->moveSelected(false);
}

void VelMenuView::slotDirNew()
{
    createNew(true);
}

void VelMenuView::slotFileNew()
{
    createNew(false);
}

bool VelMenuView::createNew(bool folder)
{
    QModelIndex place = selectedItem();
    if (!place.isValid())
        place = d->proxy->mapToSource(rootIndex());
    if (!place.isValid())
        return false;
    const QFileInfo placeInfo(d->model->filePath(place));
    const QString directory = placeInfo.isDir() ? placeInfo.filePath() : placeInfo.absolutePath();
    const FreeName::Kind kind = folder ? FreeName::Kind::Folder : FreeName::Kind::Entry;
    const FreeName::Name name = FreeName::firstIn(directory, kind);
    const QString path = directory + QLatin1Char('/') + name.fileName;

    const QPointer<VelMenuView> self(this);
    const bool kept = d->writeNew(path, folder, name.number) && d->offerNew(path, folder);
    if (self)
        Q_EMIT changed();
    return kept;
}

bool VelMenuViewPrivate::writeNew(const QString &path, bool folder, const QString &number)
{
    if (folder)
        QDir().mkpath(path);
    const QString recordPath = folder ? EntryPath::recordFileOf(path) : path;
    VelUIDesktopEntry record(recordPath);
    record.setType(folder ? QStringLiteral("Directory") : QStringLiteral("Application"));
    record.setName((folder ? QStringLiteral("Group") : QStringLiteral("Shortcut")) + number);
    record.setLocalName((folder ? VelMenuView::tr("Group") : VelMenuView::tr("Shortcut")) + number);
    record.setIcon(folder ? QStringLiteral("folder") : QStringLiteral("application-x-executable"));
    if (!record.save())
        return false;
    model->setItemName(recordPath, EntryDisplay::shownName(record));
    return true;
}

bool VelMenuViewPrivate::offerNew(const QString &path, bool folder)
{
    q->clearFindResults();
    q->showAndSelect(path);
    const QPointer<VelMenuView> self(q);
    if (edit(path))
        return true;
    if (folder) {
        QFile::remove(EntryPath::recordFileOf(path));
        QDir().rmdir(path);
    } else {
        QFile::remove(path);
    }
    if (!self)
        return false;
    model->forgetItemInfo(path);
    leaveItem(path);
    return false;
}

bool VelMenuView::slotEdit()
{
    return d->edit(selectedPath());
}

bool VelMenuViewPrivate::edit(const QString &item)
{
    if (item.isEmpty())
        return false;
    const bool isFolder = QFileInfo(item).isDir();
    const QString path = isFolder ? EntryPath::recordFileOf(item) : item;
    if (!isFolder && !EntryPath::isEntry(path)) {
        MessageBox::show(q, QMessageBox::Warning, VelMenuView::tr("Warning"),
                         VelMenuView::tr("Can't edit non desktop file"));
        return false;
    }

    const QPointer<VelMenuView> self(q);
    GuardedDialog<VelDesktopEntryEditDialog> dialog(q);
    if (!dialog->setDesktopEntryPath(path, !QFileInfo::exists(path), QString()) || !dialog.isAlive())
        return false;
    dialog->setWindowTitle(VelMenuView::tr("Desktop Entry %1").arg(path));
    if (!dialog.run() || !self)
        return false;
    q->clearFindResults();
    model->forgetItemInfo(path);
    Q_EMIT q->changed();
    return true;
}

void VelMenuView::slotDel()
{
    const QString path = selectedPath();
    if (path.isEmpty())
        return;
    const QPointer<VelMenuView> self(this);
    const auto answer =
        MessageBox::show(this, QMessageBox::Question, tr("Attention"), tr("Are you sure to delete it?"),
                         QMessageBox::Yes | QMessageBox::No, QMessageBox::Yes);
    if (!self || answer != QMessageBox::Yes)
        return;
    const QFileInfo info(path);
    // A link to a folder is removed as a file is: what it leads to is not ours to delete.
    if (info.isDir() && !info.isSymLink())
        QDir(path).removeRecursively();
    else
        d->model->remove(d->model->index(path));
    d->model->forgetItemInfo(path);
    clearFindResults();
    d->leaveItem(path);
    Q_EMIT changed();
}

void VelMenuViewPrivate::leaveItem(const QString &path)
{
    // The row goes a moment later; were it the current one then, its neighbour would be selected.
    const QModelIndex index = proxyIndex(path);
    QModelIndex next = index.sibling(index.row() + 1, 0);
    if (!next.isValid() && index.isValid())
        next = index.row() > 0 ? index.sibling(index.row() - 1, 0) : index.parent();
    if (next == q->rootIndex())
        next = QModelIndex();
    clearSelection();
    q->selectionModel()->setCurrentIndex(next, QItemSelectionModel::NoUpdate);
}
