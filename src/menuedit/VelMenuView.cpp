// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "VelMenuView.h"

#include "TreeLoader.h"
#include "VelMenuModel.h"
#include "VelMenuProxyModel.h"
#include "VelMenuViewPrivate.h"
#include "WaitCursor.h"

#include <frame/MessageBox.h>

#include <velcore/dirs.h>
#include <velintegration/startmenu.h>

#include <QContextMenuEvent>
#include <QFile>
#include <QPointer>
#include <QProcess>
#include <QTimer>

namespace {

QString startMenuDir()
{
    return QString::fromStdString(GetVelDir(VelDir::StartMenu));
}

} // namespace

VelMenuView::VelMenuView(QWidget *parent)
    : VelMenuView(QString(), -1, false, parent)
{
}

VelMenuView::VelMenuView(const QString &menuDir, int iconSize, bool editable, QWidget *parent)
    : QTreeView(parent)
    , d(new VelMenuViewPrivate(this))
{
    init(menuDir, iconSize, editable, parent);
}

VelMenuView::~VelMenuView()
{
    // Destroying a QProcess would kill what the user has just started.
    const auto processes = findChildren<QProcess *>(QString(), Qt::FindDirectChildrenOnly);
    for (QProcess *process : processes)
        process->setParent(nullptr);
    d->clear();
}

void VelMenuView::init(const QString &menuDir, int iconSize, bool editable, QWidget *parent)
{
    if (parent && parent != parentWidget())
        setParent(parent);
    d->clear();
    d->menuDir = menuDir.isEmpty() ? startMenuDir() : menuDir;
    d->editable = editable;

    setDefaultDropAction(Qt::MoveAction);
    setHeaderHidden(true);
    setUniformRowHeights(true);
    if (iconSize != -1)
        setIconSize(QSize(iconSize, iconSize));
    setDragDropMode(editable ? QAbstractItemView::DragDrop : QAbstractItemView::NoDragDrop);

    d->proxy = new VelMenuProxyModel(this);
    d->buildModel();
    d->watchRows();
    setModel(d->proxy);
    d->showRoot();
    setSortingEnabled(true);
    if (editable)
        d->makeEditable();
    connect(selectionModel(), &QItemSelectionModel::selectionChanged, this, &VelMenuView::setActionsEnabled);
    connect(selectionModel(), &QItemSelectionModel::selectionChanged, this,
            &VelMenuView::selectionChangedSlot);
}

QString VelMenuView::menuDir() const
{
    return d->menuDir;
}

QModelIndex VelMenuView::selectedItem() const
{
    const QModelIndexList selected =
        selectionModel() ? selectionModel()->selectedIndexes() : QModelIndexList();
    return selected.isEmpty() ? QModelIndex() : d->proxy->mapToSource(selected.constFirst());
}

QString VelMenuView::selectedPath() const
{
    const QModelIndex item = selectedItem();
    return item.isValid() ? d->model->filePath(item) : QString();
}

void VelMenuView::showAndSelect(const QString &path)
{
    d->clearSelection();
    const QModelIndex index = d->proxyIndex(path);
    if (!index.isValid())
        return;
    if (index.parent().isValid())
        expand(index.parent());
    d->selectOnly(index);
    QTimer::singleShot(0, this, [this, path] {
        const QModelIndex again = d->proxyIndex(path);
        if (again.isValid())
            scrollTo(again);
    });
}

void VelMenuView::invalidateSortOrder(const QModelIndex &sourceIndex)
{
    d->proxy->invalidateSortOrder(d->model->filePath(sourceIndex));
}

void VelMenuView::contextMenuEvent(QContextMenuEvent *event)
{
    if (!d->editable || !selectionModel()) {
        event->ignore();
        return;
    }
    setActionsEnabled();
    d->editMenu->exec(event->globalPos());
}

void VelMenuView::slotExe()
{
    const QString path = selectedPath();
    if (path.isEmpty())
        return;
    const QString program = QStringLiteral("vel-open");
    const QStringList arguments{QStringLiteral("--exec"), path};
    auto *process = new QProcess(this);
    connect(process, QOverload<int, QProcess::ExitStatus>::of(&QProcess::finished), process,
            &QObject::deleteLater);
    process->setProcessChannelMode(QProcess::ForwardedChannels);
    process->setStandardInputFile(QProcess::nullDevice());
    process->start(program, arguments);
    if (process->waitForStarted(2000))
        return;
    delete process;
    MessageBox::show(this, QMessageBox::Warning, tr("Warning"),
                     tr("Can't start:\n%1 %2").arg(program, arguments.join(QLatin1Char(' '))));
}

void VelMenuView::slotRecreate()
{
    const QPointer<VelMenuView> self(this);
    const auto answer = MessageBox::show(this, QMessageBox::Question, tr("Warning"),
                                         tr("All previous shortcuts\nwill be lost. Are you sure?"),
                                         QMessageBox::Ok | QMessageBox::Cancel, QMessageBox::Ok);
    if (!self || answer == QMessageBox::Cancel)
        return;
    {
        const WaitCursor waiting;
        if (!CreateStartMenu(QFile::encodeName(startMenuDir()).constData(), nullptr))
            qWarning("VelMenuView: can't create the start menu");
    }
    if (!self)
        return;
    d->clearSelection();
    // The old directory is gone together with what the model watched.
    d->buildModel();
    d->showRoot();
    clearFindResults();
    setActionsEnabled();
    Q_EMIT changed();
}

void VelMenuView::selectionChangedSlot()
{
    Q_EMIT selectionChanged(selectedPath());
}
