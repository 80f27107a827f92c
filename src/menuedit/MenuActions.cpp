// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuActions.h"

#include "ItemOrder.h"
#include "ShownMenu.h"
#include "VelMenuModel.h"
#include "VelMenuProxyModel.h"

#include <frame/OwnIcon.h>

#include <QAction>
#include <QCoreApplication>
#include <QFileInfo>
#include <QHash>
#include <QIcon>
#include <QMenu>

#include <algorithm>

namespace {

struct Description
{
    const char *name;
    const char *icon; // in the theme; may be empty
    const char *text;
    const char *textWithMnemonic; // other letters than those of the entries that come with assistance
};

// In the order of MenuActions::Action.
constexpr Description Descriptions[] = {
    {"dirNewAction", "folder-new", QT_TRANSLATE_NOOP("VelMenuView", "New folder"),
     QT_TRANSLATE_NOOP("VelMenuView", "New &folder")},
    {"fileNewAction", "document-new", QT_TRANSLATE_NOOP("VelMenuView", "New entry"),
     QT_TRANSLATE_NOOP("VelMenuView", "New entr&y")},
    {"editAction", "document-properties", QT_TRANSLATE_NOOP("VelMenuView", "Edit"),
     QT_TRANSLATE_NOOP("VelMenuView", "&Edit")},
    {"deleteAction", "edit-delete", QT_TRANSLATE_NOOP("VelMenuView", "Delete"),
     QT_TRANSLATE_NOOP("VelMenuView", "&Delete")},
    {"executeAction", "", QT_TRANSLATE_NOOP("VelMenuView", "Execute"),
     QT_TRANSLATE_NOOP("VelMenuView", "E&xecute")},
    {"findAction", "edit-find", QT_TRANSLATE_NOOP("VelMenuView", "Find"),
     QT_TRANSLATE_NOOP("VelMenuView", "F&ind")},
    {"findNextAction", "", QT_TRANSLATE_NOOP("VelMenuView", "Find Next"),
     QT_TRANSLATE_NOOP("VelMenuView", "Find &Next")},
    {"cutAction", "edit-cut", QT_TRANSLATE_NOOP("VelMenuView", "Cut"),
     QT_TRANSLATE_NOOP("VelMenuView", "Cu&t")},
    {"copyAction", "edit-copy", QT_TRANSLATE_NOOP("VelMenuView", "Copy"),
     QT_TRANSLATE_NOOP("VelMenuView", "&Copy")},
    {"pasteAction", "edit-paste", QT_TRANSLATE_NOOP("VelMenuView", "Paste"),
     QT_TRANSLATE_NOOP("VelMenuView", "&Paste")},
    {"recreateAction", "velmenuedit", QT_TRANSLATE_NOOP("VelMenuView", "Default menu..."),
     QT_TRANSLATE_NOOP("VelMenuView", "Default &menu...")},
    {"upAction", "go-up", QT_TRANSLATE_NOOP("VelMenuView", "Up"), QT_TRANSLATE_NOOP("VelMenuView", "&Up")},
    {"downAction", "go-down", QT_TRANSLATE_NOOP("VelMenuView", "Down"),
     QT_TRANSLATE_NOOP("VelMenuView", "D&own")},
};

QKeySequence keyOf(MenuActions::Action action)
{
    switch (action) {
    case MenuActions::NewEntry:
        return QKeySequence::New;
    case MenuActions::Edit:
        return Qt::Key_Space;
    case MenuActions::Delete:
        return QKeySequence::Delete;
    case MenuActions::Execute:
        return QKeySequence(QStringLiteral("Ctrl+E"));
    case MenuActions::Find:
        return QKeySequence::Find;
    case MenuActions::FindNext:
        return QKeySequence::FindNext;
    case MenuActions::Cut:
        return QKeySequence::Cut;
    case MenuActions::Copy:
        return QKeySequence::Copy;
    case MenuActions::Paste:
        return QKeySequence::Paste;
    default:
        return QKeySequence();
    }
}

// A folder counts as what it holds.
QString writtenFolderOf(const ShownMenu &menu, const QModelIndex &item)
{
    const QString path = menu.files().filePath(item);
    return menu.files().isDir(item) ? path : path.left(path.lastIndexOf(QLatin1Char('/')));
}

// Of several rows, which may be thousands in a few folders.
void lookAtAll(const ShownMenu &menu, const QModelIndexList &rows, ActionState::Selection *selection)
{
    const QModelIndex folder = rows.constFirst().parent();
    QHash<QString, bool> writable;
    selection->items = rows.size();
    selection->row = rows.constFirst().row();
    for (const QModelIndex &row : rows) {
        selection->row = std::min(selection->row, row.row());
        selection->lastRow = std::max(selection->lastRow, row.row());
        selection->areSiblings = selection->areSiblings && row.parent() == folder;
        const QString written = writtenFolderOf(menu, menu.proxy().mapToSource(row));
        auto known = writable.find(written);
        if (known == writable.end())
            known = writable.insert(written, QFileInfo(written).isWritable());
        selection->isAnyLocked = selection->isAnyLocked || !*known;
    }
}

// A letter that is put behind the text, as in Japanese, would stay in what a tool button derives from it.
void mark(QAction &action, const Description &description, bool isMarked)
{
    action.setText(QCoreApplication::translate("VelMenuView", description.text));
    action.setIconText(QString());
    action.setToolTip(QString());
    if (!isMarked)
        return;
    const QString iconText = action.iconText();
    const QString toolTip = action.toolTip();
    action.setText(QCoreApplication::translate("VelMenuView", description.textWithMnemonic));
    action.setIconText(iconText);
    action.setToolTip(toolTip);
}

ActionState stateOf(const ShownMenu &menu, const QModelIndex &item, const QModelIndexList &rows,
                    const ClipboardContents &clipboard)
{
    ActionState::Selection selection;
    selection.any = item.isValid();
    if (selection.any) {
        const QFileInfo info(menu.files().filePath(item));
        const QModelIndex shown = menu.proxy().mapFromSource(item);
        selection.writable = QFileInfo(info.isDir() ? info.filePath() : info.absolutePath()).isWritable();
        selection.filesOnClipboard = clipboard.mayHoldFiles();
        selection.row = shown.row();
        selection.count = menu.proxy().rowCount(shown.parent());
        const QString folder = item.parent().data(QFileSystemModel::FileNameRole).toString();
        selection.isByTime = ItemOrder::ruleOf(folder) == ItemOrder::Rule::ByTime;
    }
    if (rows.size() > 1)
        lookAtAll(menu, rows, &selection);
    return ActionState::of(selection);
}

} // namespace

MenuActions::MenuActions(QWidget *view, bool isStartMenu)
    : m_menu(std::make_unique<QMenu>(QCoreApplication::translate("VelMenuView", "Edit"), view))
    , m_actions(Down + 1, nullptr)
{
    for (const Action action : {NewFolder, NewEntry, Edit, Delete})
        add(view, action);
    m_menu->addSeparator();
    for (const Action action : {Execute, Find, FindNext})
        add(view, action);
    m_menu->addSeparator();
    for (const Action action : {Cut, Copy, Paste})
        add(view, action);
    m_menu->addSeparator();
    if (isStartMenu)
        add(view, Recreate);
    m_menu->addSeparator();
    add(view, Up);
    add(view, Down);
}

MenuActions::~MenuActions() = default;

void MenuActions::add(QWidget *view, Action which)
{
    const Description &description = Descriptions[which];
    const QString icon = QLatin1String(description.icon);
    QAction *action = m_menu->addAction(icon.isEmpty() ? QIcon() : OwnIcon::named(icon),
                                        QCoreApplication::translate("VelMenuView", description.text));
    action->setObjectName(QLatin1String(description.name));
    action->setShortcut(keyOf(which));
    // Space must go on to press the buttons around the tree.
    action->setShortcutContext(Qt::WidgetShortcut);
    view->addAction(action);
    m_actions[which] = action;
}

void MenuActions::setAssisted(bool assisted)
{
    action(Up)->setShortcut(assisted ? QKeySequence(QStringLiteral("Alt+Up")) : QKeySequence());
    action(Down)->setShortcut(assisted ? QKeySequence(QStringLiteral("Alt+Down")) : QKeySequence());
    for (int i = 0; i < m_actions.size(); ++i) {
        if (m_actions.at(i))
            mark(*m_actions.at(i), Descriptions[i], assisted);
    }
}

void MenuActions::enable(Action which, bool isEnabled)
{
    m_actions.at(which)->setEnabled(isEnabled);
}

void MenuActions::update(const ShownMenu &menu, const QModelIndex &item, const QModelIndexList &rows)
{
    const ActionState state = stateOf(menu, item, rows, m_clipboard);
    enable(NewFolder, state.create);
    enable(NewEntry, state.create);
    for (const Action action : {Edit, Execute})
        enable(action, state.edit);
    for (const Action action : {Delete, Cut, Copy})
        enable(action, state.remove);
    enable(Paste, state.paste);
    enable(Up, state.up);
    enable(Down, state.down);
    if (m_actions.at(Recreate))
        enable(Recreate, true);
}
