// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuFind.h"

#include "MenuSelection.h"
#include "ShownMenu.h"
#include "TreeLoader.h"
#include "VelMenuProxyModel.h"
#include "WaitCursor.h"

#include <frame/MessageBox.h>

#include <QCoreApplication>
#include <QInputDialog>
#include <QPointer>
#include <QTreeView>

MenuFind::MenuFind(QTreeView *view, const ShownMenu &menu, MenuSelection &selection)
    : m_view(view)
    , m_menu(menu)
    , m_selection(selection)
{
}

MenuFind::~MenuFind() = default;

void MenuFind::clear()
{
    m_matches.clear();
    m_shown = -1;
}

void MenuFind::ask()
{
    const QPointer<MenuFind> self(this);
    const QString text = QInputDialog::getText(m_view, QCoreApplication::translate("VelMenuView", "Find"),
                                               QCoreApplication::translate("VelMenuView", "Find string:"),
                                               QLineEdit::Normal, m_text);
    if (!self)
        return;
    m_text = text;
    find(false);
}

bool MenuFind::find(bool next)
{
    if (m_text.isEmpty())
        return false;
    if (next && showNext())
        return true;

    clear();
    const QString text = m_text;
    const QPointer<MenuFind> self(this);
    {
        const WaitCursor waiting;
        if (self)
            m_menu.loader().load(m_menu.proxy().mapToSource(m_view->rootIndex()));
        // The view may show another directory by now, and another text may have been asked for.
        if (!self || m_text != text)
            return false;
        for (const QModelIndex &match : matches())
            m_matches.append(match);
    }
    if (m_matches.isEmpty()) {
        MessageBox::show(m_view, QMessageBox::Information, QCoreApplication::translate("VelMenuView", "Find"),
                         QCoreApplication::translate("VelMenuView", "'%1' not found .").arg(text),
                         QMessageBox::Close);
        return false;
    }
    m_shown = 0;
    show();
    return true;
}

// From the first child, as a search from the root itself would begin among its siblings.
QModelIndexList MenuFind::matches() const
{
    const QModelIndex root = m_view->rootIndex();
    const QModelIndex first = root.isValid() ? m_menu.proxy().index(0, 0, root) : QModelIndex();
    if (!first.isValid())
        return {};
    return m_menu.proxy().match(first, Qt::DisplayRole, m_text, -1,
                                Qt::MatchContains | Qt::MatchWrap | Qt::MatchRecursive);
}

bool MenuFind::showNext()
{
    for (int i = m_matches.size() - 1; i >= 0; --i) {
        if (m_matches.at(i).isValid())
            continue;
        m_matches.removeAt(i);
        if (i <= m_shown)
            --m_shown;
    }
    if (m_matches.isEmpty())
        return false;
    m_shown = (m_shown + 1) % m_matches.size();
    show();
    return true;
}

void MenuFind::show()
{
    const QModelIndex match = m_matches.at(m_shown);
    m_selection.select(match);
    m_view->scrollTo(match);
}
