// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuReload.h"

#include "MenuSelection.h"
#include "OpenedFolders.h"
#include "ShownMenu.h"
#include "VelMenuModel.h"
#include "VelMenuProxyModel.h"

#include <QAction>
#include <QCoreApplication>
#include <QIcon>
#include <QItemSelectionModel>
#include <QMenu>
#include <QSet>
#include <QTreeView>

#include <utility>

MenuReload::MenuReload(QTreeView *view, const ShownMenu &menu, MenuSelection &selection,
                       std::function<void()> showAnew)
    : m_view(view)
    , m_menu(menu)
    , m_selection(selection)
    , m_showAnew(std::move(showAnew))
{
}

MenuReload::~MenuReload() = default;

void MenuReload::setOn(bool on, QMenu *menu)
{
    m_action.reset();
    m_separator.reset();
    if (!on)
        return;
    m_action = std::make_unique<QAction>(QIcon::fromTheme(QStringLiteral("view-refresh")),
                                         QCoreApplication::translate("VelMenuView", "&Reload"));
    m_action->setObjectName(QStringLiteral("reloadAction"));
    m_action->setShortcut(QKeySequence(Qt::Key_F5));
    m_action->setShortcutContext(Qt::WidgetShortcut);
    connect(m_action.get(), &QAction::triggered, this, &MenuReload::reload);
    m_view->addAction(m_action.get());
    if (!menu)
        return;
    m_separator = std::make_unique<QAction>();
    m_separator->setSeparator(true);
    menu->addActions({m_separator.get(), m_action.get()});
}

// The current item first.
QStringList MenuReload::selectedItems() const
{
    QStringList paths;
    const QModelIndexList selected = m_view->selectionModel()->selectedIndexes();
    for (const QModelIndex &index : selected) {
        const QString path = m_menu.files().filePath(m_menu.proxy().mapToSource(index));
        if (index == m_view->currentIndex())
            paths.prepend(path);
        else
            paths.append(path);
    }
    return paths;
}

void MenuReload::reload()
{
    const QSet<QString> opened = OpenedFolders::in(*m_view, m_menu, m_selection);
    const QStringList selected = selectedItems();
    m_showAnew();
    for (const QString &path : opened)
        m_view->expand(m_selection.shown(path));
    selectAgain(selected);
}

void MenuReload::selectAgain(const QStringList &paths)
{
    for (const QString &path : paths) {
        const QModelIndex index = m_selection.shown(path);
        if (!index.isValid())
            continue;
        if (m_selection.item().isValid()) {
            m_view->selectionModel()->select(index, QItemSelectionModel::Select);
            continue;
        }
        m_selection.select(index);
        m_selection.reveal(path);
    }
}
