// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FolderOpening.h"

#include "ContainingFolder.h"
#include "MenuSelection.h"
#include "MenuVoice.h"

#include <QAction>
#include <QCoreApplication>
#include <QIcon>
#include <QMenu>

FolderOpening::FolderOpening(QWidget *view, const MenuSelection &selection, MenuVoice &voice)
    : m_view(view)
    , m_selection(selection)
    , m_voice(voice)
    , m_action(new QAction(QIcon::fromTheme(QStringLiteral("document-open-folder")),
                           QCoreApplication::translate("VelMenuView", "Open containin&g folder"), this))
{
    m_action->setObjectName(QStringLiteral("openFolderAction"));
    connect(m_action, &QAction::triggered, this, &FolderOpening::open);
}

FolderOpening::~FolderOpening() = default;

void FolderOpening::setContextMenu(QMenu *menu, QAction *next)
{
    if (m_contextMenu) {
        m_contextMenu->disconnect(this);
        m_contextMenu->removeAction(m_action);
    }
    m_contextMenu = menu;
    if (!menu)
        return;
    menu->insertAction(next, m_action);
    connect(menu, &QMenu::aboutToShow, this, &FolderOpening::update);
}

void FolderOpening::update()
{
    m_action->setEnabled(m_selection.item().isValid());
}

void FolderOpening::open()
{
    const QStringList paths = m_selection.paths();
    if (paths.isEmpty())
        return;
    // The view may show another menu by then.
    const QPointer<FolderOpening> self(this);
    ContainingFolder::show(m_view, paths, [self](const QString &folder, const QString &reason) {
        if (self)
            self->m_voice.tell(QCoreApplication::translate("VelMenuView", "The folder %1 was not opened: %2.")
                                   .arg(folder, reason),
                               MenuVoice::Failure, self->m_selection.shown(folder));
    });
}
