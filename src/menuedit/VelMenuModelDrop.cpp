// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FileTransfer.h"
#include "FolderWatch.h"
#include "MenuClipboard.h"
#include "OnDisk.h"
#include "VelMenuModel.h"
#include "VelMenuView.h"

#include <frame/EntryPath.h>
#include <frame/GuardedDialog.h>

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QMessageBox>
#include <QMimeData>
#include <QPersistentModelIndex>
#include <QPointer>
#include <QSaveFile>
#include <QSortFilterProxyModel>
#include <QToolTip>

// The part of the model that carries out drops.

/// What is to be done; the mime data may be gone while the user is asked.
struct VelMenuModel::Drop
{
    Qt::DropAction action;
    int row; ///< the source row before which the first file is to be listed, or -1
    QPersistentModelIndex parent;
    QStringList sources;
    QString targetDir;
    QString name; ///< of the first file
    QString target; ///< of the first file
};

namespace {

// The contents of a file, to be put back if what follows fails.
class FileSnapshot
{
public:
    explicit FileSnapshot(const QString &path)
        : m_path(path)
        , m_bytes(contents(path))
    {
    }

    void restore() const
    {
        if (contents(m_path) == m_bytes)
            return;
        if (m_bytes.isNull()) {
            QFile::remove(m_path);
            return;
        }
        QSaveFile file(m_path);
        if (file.open(QIODevice::WriteOnly) && file.write(m_bytes) == m_bytes.size())
            file.commit();
    }

private:
    // Null when there is no such file, which an empty one is not.
    static QByteArray contents(const QString &path)
    {
        QFile file(path);
        if (!QFileInfo(path).isFile() || !file.open(QIODevice::ReadOnly))
            return QByteArray();
        const QByteArray bytes = file.readAll();
        return bytes.isNull() ? QByteArray("") : bytes;
    }

    QString m_path;
    QByteArray m_bytes;
};

QString failureText(const FileTransfer::Result &result, Qt::DropAction action)
{
    switch (result.failure) {
    case FileTransfer::Failure::None:
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
        return (action == Qt::MoveAction ? QFileSystemModel::tr("Can't move %1: %2")
                                         : QFileSystemModel::tr("Can't copy %1: %2"))
            .arg(result.path, result.reason);
    }
    return QString();
}

FileTransfer::Action transferAction(Qt::DropAction action)
{
    return action == Qt::MoveAction ? FileTransfer::Action::Move : FileTransfer::Action::Copy;
}

// The child of \a parent at \a row, followed while the user is asked.
QPersistentModelIndex childAt(const QFileSystemModel &model, int row, const QModelIndex &parent)
{
    return row >= 0 && row < model.rowCount(parent) ? QPersistentModelIndex(model.index(row, 0, parent))
                                                    : QPersistentModelIndex();
}

} // namespace

bool VelMenuModel::dropMimeData(const QMimeData *data, Qt::DropAction action, int row, int column,
                                const QModelIndex &parent)
{
    Q_UNUSED(column)
    if (parent.row() < 0 || parent.column() < 0 || !parent.model() || !data || !data->hasUrls()
        || action == Qt::IgnoreAction)
        return false;
    Drop drop{action, row, parent, MenuClipboard::localPaths(data), filePath(parent), QString(), QString()};
    if (drop.sources.isEmpty() || drop.sources.constFirst().isEmpty())
        return false;
    drop.name = QFileInfo(drop.sources.constFirst()).fileName();
    drop.target = QDir(drop.targetDir).filePath(drop.name);
    return FileTransfer::liesIn(drop.sources.constFirst(), drop.targetDir) ? dropIntoOwnFolder(drop)
                                                                           : dropIntoOtherFolder(drop);
}

bool VelMenuModel::dropIntoOwnFolder(const Drop &drop)
{
    // What is gone must not be listed.
    if (!OnDisk::exists(drop.sources.constFirst())) {
        tellAtItem(drop.target,
                   failureText({FileTransfer::Failure::SourceGone, drop.target, QString()}, drop.action));
        return false;
    }
    if (drop.action == Qt::MoveAction && !fixSortOrder(drop))
        return false;
    finish(drop, true);
    return true;
}

bool VelMenuModel::dropIntoOtherFolder(const Drop &drop)
{
    if (isReadOnly())
        return false;
    Drop current = drop;
    if (QFileInfo::exists(drop.target)) {
        const QPersistentModelIndex following = childAt(*this, drop.row, drop.parent);
        const bool isLast = drop.row == rowCount(drop.parent);
        if (!mayOverwrite(drop.target) || !drop.parent.isValid())
            return false;
        if (drop.row != -1)
            current.row = isLast ? rowCount(drop.parent) : following.row();
    }
    return carryOut(current);
}

// Asks before a file that exists; the answer is No as well when the model is gone meanwhile.
// The box is made by hand: the static function would add a No button to show its default.
bool VelMenuModel::mayOverwrite(const QString &target)
{
    const QPointer<VelMenuModel> self(this);
    GuardedDialog<QMessageBox> box(QMessageBox::Question, QFileSystemModel::tr("Attention"),
                                   QFileSystemModel::tr("%1 already exists. Overwrite?").arg(target),
                                   QMessageBox::Yes, qobject_cast<QWidget *>(QObject::parent()));
    box->setDefaultButton(QMessageBox::No);
    const int answer = box.exec();
    return self && answer != QMessageBox::No;
}

bool VelMenuModel::fixSortOrder(const Drop &drop)
{
    return !view || view->fixSortOrderForNew(drop.name, drop.row, drop.parent);
}

bool VelMenuModel::carryOut(const Drop &drop)
{
    const FileTransfer::Result possible = FileTransfer::check(drop.sources, drop.targetDir);
    if (!possible.succeeded()) {
        tellAtItem(drop.target, failureText(possible, drop.action));
        return false;
    }
    const FileSnapshot directoryFile(EntryPath::recordFileOf(drop.targetDir));
    if (drop.row != -1 && !fixSortOrder(drop))
        return false;
    if (!(drop.action == Qt::LinkAction ? link(drop) : transfer(drop))) {
        directoryFile.restore();
        return false;
    }
    finish(drop, drop.row != -1);
    return true;
}

bool VelMenuModel::transfer(const Drop &drop)
{
    const QStringList released =
        drop.action == Qt::MoveAction ? m_watch->release(drop.sources) : QStringList();
    const FileTransfer::Result result =
        FileTransfer::transfer(drop.sources, drop.targetDir, transferAction(drop.action));
    // What could not be moved is still there.
    m_watch->watchAgain(released);
    if (!result.succeeded())
        tellAtItem(drop.target, failureText(result, drop.action));
    return result.succeeded();
}

bool VelMenuModel::link(const Drop &drop)
{
    QList<QUrl> urls;
    for (const QString &source : drop.sources)
        urls.append(QUrl::fromLocalFile(source));
    QMimeData data;
    data.setUrls(urls);
    return QFileSystemModel::dropMimeData(&data, drop.action, drop.row, 0, drop.parent);
}

void VelMenuModel::finish(const Drop &drop, bool sortAnew)
{
    if (view && sortAnew)
        view->invalidateSortOrder(drop.parent);
    if (drop.action == Qt::MoveAction) {
        for (const QString &source : drop.sources)
            forgetItemInfo(source);
    }
    // Every file has its row at once, whether or not its folder is being watched already.
    for (const QString &source : drop.sources) {
        const QString target = QDir(drop.targetDir).filePath(QFileInfo(source).fileName());
        if (QFileInfo::exists(target))
            index(target);
    }
    if (view) {
        view->showAndSelect(drop.target);
        view->setActionsEnabled();
    }
    Q_EMIT changed();
}

// Tells without a window: the user goes on undisturbed, the item tells why nothing happened.
void VelMenuModel::tellAtItem(const QString &path, const QString &text)
{
    if (!view)
        return;
    QModelIndex shown;
    if (const auto *proxy = qobject_cast<const QSortFilterProxyModel *>(view->model())) {
        if (QFileInfo::exists(path))
            shown = proxy->mapFromSource(index(path));
    }
    const QRect area = shown.isValid() ? view->visualRect(shown) : QRect();
    const QPoint place = area.isValid() ? area.bottomLeft() : view->viewport()->rect().center();
    QToolTip::showText(view->viewport()->mapToGlobal(place), text, view->viewport());
}
