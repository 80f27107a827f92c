// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuDuplication.h"

#include "FileWork.h"
#include "FolderOrder.h"
#include "FreeName.h"
#include "ItemOrder.h"
#include "MenuFind.h"
#include "MenuHistory.h"
#include "MenuSelection.h"
#include "MenuVoice.h"
#include "OnDisk.h"
#include "ShownMenu.h"
#include "ShownOrder.h"
#include "SortOrder.h"
#include "StepRecorder.h"
#include "TransferText.h"
#include "VelMenuModel.h"
#include "VelMenuProxyModel.h"

#include <frame/EntryPath.h>

#include <QAction>
#include <QCoreApplication>
#include <QFileInfo>
#include <QIcon>
#include <QMenu>
#include <QSet>
#include <QTreeView>

#include <algorithm>

namespace {

// The files that get their rows at once.
constexpr int MostAtOnce = 20;

QString folderOf(const QString &path)
{
    return QFileInfo(path).path();
}

QString fileNameOf(const QString &path)
{
    return QFileInfo(path).fileName();
}

QVector<FileTransfer::Item> copiesOf(const QStringList &paths)
{
    QVector<FileTransfer::Item> items;
    QSet<QString> promised;
    for (const QString &path : paths) {
        const QString folder = folderOf(path) + QLatin1Char('/');
        const auto kind = QFileInfo(path).isDir() ? FreeName::Kind::Folder : FreeName::Kind::Entry;
        const QString target = folder + FreeName::like(fileNameOf(path), kind, [&](const QString &name) {
                                   return promised.contains(folder + name) || OnDisk::exists(folder + name);
                               });
        promised.insert(target);
        items.append({path, target});
    }
    return items;
}

} // namespace

MenuDuplication::MenuDuplication(QTreeView *view, const ShownMenu &menu, MenuSelection &selection,
                                 MenuFind &find, MenuVoice &voice, MenuHistory &history)
    : m_view(view)
    , m_menu(menu)
    , m_selection(selection)
    , m_find(find)
    , m_voice(voice)
    , m_history(history)
    , m_action(new QAction(QIcon::fromTheme(QStringLiteral("edit-copy")),
                           QCoreApplication::translate("VelMenuView", "Dup&licate"), this))
{
    m_action->setObjectName(QStringLiteral("duplicateAction"));
    m_action->setShortcut(QKeySequence(QStringLiteral("Ctrl+D")));
    m_action->setShortcutContext(Qt::WidgetShortcut);
    connect(m_action, &QAction::triggered, this, &MenuDuplication::duplicate);
}

MenuDuplication::~MenuDuplication() = default;

void MenuDuplication::setContextMenu(QMenu *menu, QAction *before)
{
    if (m_contextMenu) {
        m_contextMenu->disconnect(this);
        m_contextMenu->removeAction(m_action);
    }
    m_view->removeAction(m_action);
    m_contextMenu = menu;
    if (!menu)
        return;
    const QList<QAction *> actions = menu->actions();
    menu->insertAction(actions.value(actions.indexOf(before) + 1), m_action);
    m_view->addAction(m_action);
    connect(menu, &QMenu::aboutToShow, this, &MenuDuplication::update);
    // The key has to tell why it cannot be done.
    connect(menu, &QMenu::aboutToHide, this, [this] { m_action->setEnabled(true); });
}

void MenuDuplication::update()
{
    const QStringList paths = m_selection.paths();
    m_action->setEnabled(!paths.isEmpty() && std::all_of(paths.begin(), paths.end(), [](const QString &path) {
        return QFileInfo(folderOf(path)).isWritable();
    }));
}

void MenuDuplication::duplicate()
{
    const Items items = copiesOf(m_selection.paths());
    if (items.isEmpty())
        return;
    const QString name = m_history.nameOf(items.constFirst().source);
    const Orders orders = ordersWith(items);
    const std::unique_ptr<StepRecorder> recorder = m_history.record();
    for (const FileTransfer::Item &item : items) {
        if (recorder)
            recorder->mayMake(item.target);
    }
    for (auto order = orders.begin(); recorder && order != orders.end(); ++order)
        recorder->mayWrite(EntryPath::recordFileOf(order.key()));
    const QPointer<MenuDuplication> self(this);
    if (!copy(items) || !self)
        return;
    const QStringList complaints = write(orders);
    show(items);
    QStringList targets;
    for (const FileTransfer::Item &item : items)
        targets.append(item.target);
    const MenuVoice::Subject subject =
        m_history.add(recorder,
                      items.size() == 1 ? StepText(StepText::Kind::Duplicate, name)
                                        : StepText(StepText::Kind::DuplicateItems, QString(), items.size()),
                      targets);
    if (self && !complaints.isEmpty())
        m_voice.tell(complaints.join(QLatin1Char('\n')), MenuVoice::Failure, QModelIndex(), subject);
    if (self)
        Q_EMIT changed();
}

// Whether all are there; the user is told when they are not.
bool MenuDuplication::copy(const Items &items)
{
    const QPointer<MenuDuplication> self(this);
    FileTransfer::Result result;
    {
        FileWork work(m_view, QCoreApplication::translate("VelMenuView", "Copy"),
                      QCoreApplication::translate("VelMenuView", "Copying files..."));
        result = FileTransfer::transfer(items, FileTransfer::Action::Copy, work);
    }
    const QString complaint = TransferText::of(result, Qt::CopyAction);
    if (self && !complaint.isEmpty())
        m_voice.tell(complaint, MenuVoice::Failure, m_selection.shown(items.constFirst().source));
    return result.succeeded();
}

// None for folders that are ordered by time.
MenuDuplication::Orders MenuDuplication::ordersWith(const Items &items) const
{
    QMap<QString, QHash<QString, QString>> copies;
    for (const FileTransfer::Item &item : items)
        copies[folderOf(item.source)].insert(fileNameOf(item.source), fileNameOf(item.target));
    Orders orders;
    for (auto folder = copies.begin(); folder != copies.end(); ++folder) {
        if (ItemOrder::ruleOf(fileNameOf(folder.key())) == ItemOrder::Rule::ByList)
            orders.insert(folder.key(),
                          SortOrder::withCopies(
                              ShownOrder::of(m_menu.proxy(), m_menu.files().index(folder.key())), *folder));
    }
    return orders;
}

// What the user is to hear of those that could not be saved.
QStringList MenuDuplication::write(const Orders &orders) const
{
    QStringList complaints;
    for (auto order = orders.begin(); order != orders.end(); ++order) {
        if (!FolderOrder::write(order.key(), *order))
            complaints.append(FolderOrder::notSaved(order.key()));
        m_menu.files().noteRecordFile(order.key());
    }
    return complaints;
}

void MenuDuplication::show(const Items &items) const
{
    QSet<QString> folders;
    QStringList targets;
    for (const FileTransfer::Item &item : items) {
        m_menu.files().forgetItemInfo(item.target);
        folders.insert(folderOf(item.target));
        targets.append(item.target);
    }
    for (const QString &target : targets.mid(0, MostAtOnce))
        m_menu.files().index(target);
    for (const QString &folder : qAsConst(folders))
        m_menu.proxy().invalidateSortOrder(folder);
    m_find.clear();
    m_selection.show(targets);
}
