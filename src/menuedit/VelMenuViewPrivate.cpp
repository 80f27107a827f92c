// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "VelMenuViewPrivate.h"

#include "EntryExecution.h"
#include "ItemKey.h"
#include "ItemTransfer.h"
#include "RebuildRecord.h"
#include "StartMenu.h"
#include "StepRecorder.h"
#include "VelMenuModel.h"
#include "VelMenuProxyModel.h"
#include "VelMenuView.h"

#include <frame/EntryPath.h>

#include <QAction>
#include <QCoreApplication>
#include <QFileInfo>
#include <QItemSelectionModel>
#include <QKeyEvent>
#include <QMenu>
#include <QMetaMethod>
#include <QPointer>

namespace {

// Selected items that are looked at whenever there is one more or less.
constexpr int MostAtOnce = 100;

} // namespace

VelMenuViewPrivate::VelMenuViewPrivate(VelMenuView *view, const QString &directory, bool isEditable)
    : q(view)
    , voice(view, [view] { return view->isSignalConnected(QMetaMethod::fromSignal(&VelMenuView::told)); })
    , menu(directory.isEmpty() ? StartMenu::directory() : directory, isEditable, view, view)
    , selection(view, menu)
    , severalRows(view, selection)
    , find(view, menu, selection, voice)
    , filter(view, menu, selection, voice)
    , history(view, menu, selection, find, voice)
    , hiding(menu, selection, find, voice, history)
    , moving(menu, selection, find, voice, history)
    , editing(view, menu, selection, find, voice, history)
    , deletion(view, menu, selection, find, voice, history)
    , duplication(view, menu, selection, find, voice, history)
    , sorting(menu, selection, find, voice, history)
    , folderOpening(view, selection, voice)
    , reloading(view, menu, selection, [this] { showAnew(); })
    , openedFolders(view, menu, selection)
    , cutMark(view, menu)
    , dragOpening(view)
    , m_rootWatch(menu.directory())
{
}

VelMenuViewPrivate::~VelMenuViewPrivate()
{
    QObject::disconnect(q, &QAbstractItemView::doubleClicked, q, &VelMenuView::slotEdit);
    const std::unique_ptr<QItemSelectionModel> former(q->selectionModel());
    q->setModel(nullptr);
}

MenuVoice &VelMenuViewPrivate::voiceOf(const VelMenuView &view)
{
    return view.d->voice;
}

MenuSelection &VelMenuViewPrivate::selectionOf(const VelMenuView &view)
{
    return view.d->selection;
}

OpenedFolders &VelMenuViewPrivate::openedFoldersOf(const VelMenuView &view)
{
    return view.d->openedFolders;
}

MenuHistory &VelMenuViewPrivate::historyOf(const VelMenuView &view)
{
    return view.d->history;
}

void VelMenuViewPrivate::setAssisted(bool assisted)
{
    if (assisted != isAssisted)
        setAssistedTree(assisted);
    isAssisted = assisted;
    history.setOn(assisted && menu.isEditable());
    historyEnd.reset();
    if (!history.isOn() || !actions)
        return;
    QAction *first = actions->action(MenuActions::NewFolder);
    historyEnd = std::make_unique<QAction>();
    historyEnd->setSeparator(true);
    actions->menu()->insertActions(first, {history.undoAction(), history.redoAction(), historyEnd.get()});
}

void VelMenuViewPrivate::show()
{
    connectFiles();
    QObject::connect(&menu.proxy(), &QAbstractItemModel::rowsRemoved, q, [this] { hideTopLevel(); });
    QObject::connect(&menu.proxy(), &QAbstractItemModel::modelReset, q, [this] { hideTopLevel(); });
    QObject::connect(&menu.proxy(), &QAbstractItemModel::rowsInserted, q, [this](const QModelIndex &parent) {
        if (!parent.isValid())
            hideTopLevel();
    });
    q->setModel(&menu.proxy());
    if (q->accessibleName().isEmpty())
        q->setAccessibleName(QCoreApplication::translate("VelMenuView", "Menu", "the tree"));
    showRoot();
    q->setSortingEnabled(true);
    if (menu.isEditable())
        makeEditable();
    QObject::connect(&editing, &MenuEditing::changed, q, &VelMenuView::changed);
    QObject::connect(&deletion, &MenuDeletion::changed, q, &VelMenuView::changed);
    QObject::connect(&duplication, &MenuDuplication::changed, q, &VelMenuView::changed);
    QObject::connect(&history, &MenuHistory::changed, q, &VelMenuView::setActionsEnabled);
    QObject::connect(&history, &MenuHistory::changed, q, &VelMenuView::changed);
    QObject::connect(&history, &MenuHistory::replaced, q, [this] { showReplaced(); });
    QObject::connect(&moving, &MenuMoving::changed, q, &VelMenuView::setActionsEnabled);
    QObject::connect(&moving, &MenuMoving::changed, q, &VelMenuView::changed);
    QObject::connect(&hiding, &MenuHiding::changed, q, &VelMenuView::changed);
    QObject::connect(&sorting, &MenuSorting::changed, q, &VelMenuView::changed);
    QObject::connect(&voice, &MenuVoice::told, q, &VelMenuView::told);
    QObject::connect(&m_rootWatch, &RootWatch::replaced, q, [this] { showReplaced(); });
    connectSelection();
}

// Of several selected items the keyboard chooses one, which no change of the selection tells.
void VelMenuViewPrivate::connectSelection()
{
    const QItemSelectionModel *model = q->selectionModel();
    // Rows of thousands may go one by one.
    QObject::connect(model, &QItemSelectionModel::selectionChanged, q, [this] {
        if (selection.count() > MostAtOnce)
            m_refresh.start(0);
        else
            q->setActionsEnabled();
    });
    QObject::connect(model, &QItemSelectionModel::selectionChanged, q, &VelMenuView::selectionChangedSlot);
    QObject::connect(model, &QItemSelectionModel::selectionChanged, &selection, &MenuSelection::noteSelected);
    QObject::connect(model, &QItemSelectionModel::currentChanged, &m_refresh, [this] {
        if (severalRows.isOn())
            m_refresh.start(0);
    });
}

void VelMenuViewPrivate::tellSelection()
{
    m_told = selection.path();
    Q_EMIT q->selectionChanged(m_told);
}

void VelMenuViewPrivate::showAnew()
{
    selection.clear();
    m_rootWatch.begin();
    menu.build();
    connectFiles();
    showRoot();
    find.clear();
    q->setActionsEnabled();
}

// What was open in the menu that was here stays open in the one that came.
void VelMenuViewPrivate::showReplaced()
{
    const QStringList opened = isAssisted ? openedFolders.opened() : QStringList();
    showAnew();
    openedFolders.open(opened);
}

void VelMenuViewPrivate::putSelected(Qt::DropAction action)
{
    if (hasSeveral())
        ItemTransfer::put(selection.paths(), action);
    else if (selection.item().isValid())
        q->FillClipboard(selection.item(), action);
    q->setActionsEnabled();
}

void VelMenuViewPrivate::removeSelected()
{
    if (!history.isOn()) {
        editing.remove(selection.path());
        return;
    }
    deletion.remove(selection.paths());
}

// By then, the view may show another menu.
void VelMenuViewPrivate::execute(const QString &path) const
{
    const auto tell = [view = q, path, name = history.nameOf(path)](const QString &reason) {
        voiceOf(*view).tell(
            QCoreApplication::translate("VelMenuView", "%1 was not started: %2.").arg(name, reason),
            MenuVoice::Failure, view->d->selection.shown(path));
    };
    EntryExecution::start(q, path, tell);
}

void VelMenuViewPrivate::recreate()
{
    const QPointer<VelMenuView> view(q);
    const std::unique_ptr<StepRecorder> recorder = history.record();
    std::unique_ptr<RebuildRecord> rebuilding;
    const auto begin = [&] {
        if (recorder)
            rebuilding = std::make_unique<RebuildRecord>(menu.directory(), *recorder);
    };
    if (!StartMenu::recreate(q, voice, begin) || !view)
        return;
    if (rebuilding)
        rebuilding->finish();
    showReplaced();
    Q_EMIT q->changed();
    if (view)
        history.add(recorder, StepText(StepText::Kind::Rebuild), {});
}

bool VelMenuViewPrivate::takeKey(const QKeyEvent &event)
{
    const QModelIndex current = q->currentIndex();
    if (!current.isValid())
        return false;
    const bool isFolder = menu.files().isDir(menu.proxy().mapToSource(current));
    const ItemKey::Use use = ItemKey::of(event.key(), event.modifiers(), menu.isEditable(), isFolder);
    // A key that is held does it once.
    if (use == ItemKey::Use::None || event.isAutoRepeat())
        return use != ItemKey::Use::None;
    if (use == ItemKey::Use::Toggle)
        q->setExpanded(current, !q->isExpanded(current));
    else
        editCurrent();
    return true;
}

bool VelMenuViewPrivate::isKeyToMove(const QKeyEvent &event) const
{
    return isAssisted && actions && (event.modifiers() & ~Qt::KeypadModifier) == Qt::AltModifier
        && (event.key() == Qt::Key_Up || event.key() == Qt::Key_Down);
}

void VelMenuViewPrivate::editCurrent()
{
    if (selection.isSeveral() || !q->selectionModel()->isSelected(q->currentIndex()))
        selection.select(q->currentIndex());
    if (actions->action(MenuActions::Edit)->isEnabled()) {
        q->slotEdit();
        return;
    }
    const QFileInfo info(selection.path());
    voice.tell(QCoreApplication::translate("VelMenuView",
                                           "%1 cannot be edited, because the folder %2 may not be written.")
                   .arg(info.filePath(), info.isDir() ? info.filePath() : info.path()),
               MenuVoice::Failure, q->currentIndex());
}

void VelMenuViewPrivate::setAssistedTree(bool assisted)
{
    menu.setAssisted(assisted);
    editing.setAssisted(assisted);
    cutMark.setOn(assisted);
    dragOpening.setOn(assisted);
    severalRows.setOn(assisted && actions);
    emptyLabel = assisted && actions ? std::make_unique<EmptyMenuLabel>(q, menu) : nullptr;
    folderOpening.setContextMenu(assisted && actions ? actions->menu() : nullptr,
                                 actions ? actions->action(MenuActions::Find) : nullptr);
    sorting.setContextMenu(assisted && actions ? actions->menu() : nullptr);
    reloading.setOn(assisted, actions ? actions->menu() : nullptr);
    if (actions) {
        hiding.setContextMenu(assisted ? actions->menu() : nullptr);
        duplication.setContextMenu(assisted ? actions->menu() : nullptr, actions->action(MenuActions::Paste));
        actions->setAssisted(assisted);
    }
    if (assisted)
        return;
    filter.setText(QString());
    setHiddenShown(false);
}

// What is no longer shown may not stay selected.
void VelMenuViewPrivate::setHiddenShown(bool isShown)
{
    if (!isShown)
        selection.deselect(
            [](const QModelIndex &index) { return index.data(VelMenuModel::HiddenRole).toBool(); });
    find.clear();
    menu.proxy().setHiddenShown(isShown);
    const QPointer<VelMenuView> view(q);
    filter.setHiddenFound(isShown);
    if (view)
        view->setActionsEnabled();
}

void VelMenuViewPrivate::makeEditable()
{
    actions = std::make_unique<MenuActions>(q, menu.directory() == StartMenu::directory());
    connectActions();
    connectRows();
    q->setActionsEnabled();
    QObject::connect(q, &QAbstractItemView::doubleClicked, q, &VelMenuView::slotEdit);
    QObject::connect(&actions->clipboard(), &ClipboardContents::changed, q, &VelMenuView::setActionsEnabled);
    q->setDropIndicatorShown(true);
}

void VelMenuViewPrivate::connectActions()
{
    const auto connectTo = [this](MenuActions::Action action, auto slot) {
        if (actions->action(action))
            QObject::connect(actions->action(action), &QAction::triggered, q, slot);
    };
    connectTo(MenuActions::NewFolder, &VelMenuView::slotDirNew);
    connectTo(MenuActions::NewEntry, &VelMenuView::slotFileNew);
    connectTo(MenuActions::Edit, &VelMenuView::slotEdit);
    connectTo(MenuActions::Delete, &VelMenuView::slotDel);
    connectTo(MenuActions::Execute, &VelMenuView::slotExe);
    connectTo(MenuActions::Find, &VelMenuView::slotFind);
    connectTo(MenuActions::FindNext, &VelMenuView::slotFindNext);
    connectTo(MenuActions::Cut, &VelMenuView::slotCut);
    connectTo(MenuActions::Copy, &VelMenuView::slotCopy);
    connectTo(MenuActions::Paste, &VelMenuView::slotPaste);
    connectTo(MenuActions::Recreate, &VelMenuView::slotRecreate);
    connectTo(MenuActions::Up, &VelMenuView::slotUp);
    connectTo(MenuActions::Down, &VelMenuView::slotDown);
}

// Where an item stands among the others decides whether it can go up or down.
void VelMenuViewPrivate::connectRows()
{
    m_refresh.setSingleShot(true);
    QObject::connect(&m_refresh, &QTimer::timeout, q, [this] {
        q->setActionsEnabled();
        if (severalRows.isOn() && selection.path() != m_told)
            tellSelection();
    });
    const auto refresh = [this] { m_refresh.start(0); };
    const VelMenuProxyModel *rows = &menu.proxy();
    QObject::connect(rows, &QAbstractItemModel::rowsInserted, &m_refresh, refresh);
    QObject::connect(rows, &QAbstractItemModel::rowsRemoved, &m_refresh, refresh);
    QObject::connect(rows, &QAbstractItemModel::rowsMoved, &m_refresh, refresh);
    QObject::connect(rows, &QAbstractItemModel::layoutChanged, &m_refresh, refresh);
    QObject::connect(rows, &QAbstractItemModel::modelReset, &m_refresh, refresh);
}

void VelMenuViewPrivate::connectFiles()
{
    if (menu.isEditable())
        QObject::connect(&menu.files(), &VelMenuModel::changed, q, &VelMenuView::changed);
}

// None when the directory does not exist.
void VelMenuViewPrivate::showRoot()
{
    q->setRootIndex(menu.proxy().mapFromSource(menu.files().index(menu.directory())));
    hideTopLevel();
}

// Without its root the tree would show the file system instead of nothing. While there is a root,
// nothing is hidden: a view starts no drag from below a hidden row.
void VelMenuViewPrivate::hideTopLevel()
{
    const bool isRootless = !q->rootIndex().isValid();
    for (int row = 0; row < menu.proxy().rowCount(); ++row) {
        if (q->isRowHidden(row, QModelIndex()) != isRootless)
            q->setRowHidden(row, QModelIndex(), isRootless);
    }
}
