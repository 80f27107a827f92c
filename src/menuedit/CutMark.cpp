// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "CutMark.h"

#include "MenuClipboard.h"
#include "ShownMenu.h"
#include "VelMenuModel.h"
#include "VelMenuProxyModel.h"

#include <QClipboard>
#include <QGuiApplication>
#include <QTreeView>

CutMark::CutMark(QTreeView *view, const ShownMenu &menu)
    : m_view(view)
    , m_menu(menu)
{
    connect(QGuiApplication::clipboard(), &QClipboard::dataChanged, this, &CutMark::look);
    connect(&menu.proxy(), &QAbstractProxyModel::sourceModelChanged, this, &CutMark::look);
}

CutMark::~CutMark() = default;

void CutMark::setOn(bool on)
{
    m_isOn = on;
    look();
}

// Another program is not asked: it may never answer, and what it cut is no business of this menu.
void CutMark::look()
{
    const QClipboard *clipboard = QGuiApplication::clipboard();
    const QMimeData *data = m_isOn && clipboard->ownsClipboard() ? clipboard->mimeData() : nullptr;
    const bool isCut = data && MenuClipboard::format(data) == MenuClipboard::moveFormat();
    m_menu.files().setCut(isCut ? MenuClipboard::localPaths(data) : QStringList());
    // The rows may be any, and asking for one by its path would make it.
    m_view->viewport()->update();
}
