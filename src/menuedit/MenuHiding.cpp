// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuHiding.h"

#include "EntryState.h"
#include "MenuFind.h"
#include "MenuHistory.h"
#include "MenuSelection.h"
#include "MenuVoice.h"
#include "ShownMenu.h"
#include "StepRecorder.h"
#include "VelMenuModel.h"

#include <frame/DesktopEntryRecord.h>
#include <frame/EntryPath.h>

#include <QAction>
#include <QCoreApplication>
#include <QFileInfo>
#include <QMenu>

#include <algorithm>

MenuHiding::MenuHiding(const ShownMenu &menu, MenuSelection &selection, MenuFind &find, MenuVoice &voice,
                       MenuHistory &history)
    : m_menu(menu)
    , m_selection(selection)
    , m_find(find)
    , m_voice(voice)
    , m_history(history)
    , m_hide(new QAction(QCoreApplication::translate("VelMenuView", "&Hide"), this))
    , m_showAgain(new QAction(QCoreApplication::translate("VelMenuView", "Sho&w again"), this))
{
    m_hide->setObjectName(QStringLiteral("hideAction"));
    m_showAgain->setObjectName(QStringLiteral("showAgainAction"));
    connect(m_hide, &QAction::triggered, this, &MenuHiding::hideSelected);
    connect(m_showAgain, &QAction::triggered, this, &MenuHiding::showSelectedAgain);
}

MenuHiding::~MenuHiding() = default;

void MenuHiding::setContextMenu(QMenu *menu)
{
    if (m_contextMenu) {
        m_contextMenu->disconnect(this);
        m_contextMenu->removeAction(m_hide);
        m_contextMenu->removeAction(m_showAgain);
    }
    m_contextMenu = menu;
    if (!menu)
        return;
    const QList<QAction *> actions = menu->actions();
    const auto separator = std::find_if(actions.begin(), actions.end(),
                                        [](const QAction *action) { return action->isSeparator(); });
    QAction *const before = separator == actions.end() ? nullptr : *separator;
    menu->insertActions(before, {m_hide, m_showAgain});
    connect(menu, &QMenu::aboutToShow, this, &MenuHiding::update);
}

// Empty where a folder or another file is selected.
QString MenuHiding::selectedEntry() const
{
    const QString path = m_selection.path();
    return EntryPath::isEntry(path) && QFileInfo(path).isFile() ? path : QString();
}

void MenuHiding::update()
{
    const QString path = selectedEntry();
    const EntryState::Kind state =
        path.isEmpty() ? EntryState::Kind::Shown : EntryState::of(VelUIDesktopEntry(path));
    const bool isMarked = EntryState::isOutsideMenu(state) && state != EntryState::Kind::NotInstalled;
    const bool isWritable = !path.isEmpty() && state != EntryState::Kind::Malformed
        && QFileInfo(QFileInfo(path).absolutePath()).isWritable();
    m_hide->setVisible(!isMarked);
    m_showAgain->setVisible(isMarked);
    m_hide->setEnabled(isWritable);
    m_showAgain->setEnabled(isWritable);
}

void MenuHiding::hideSelected()
{
    mark(&EntryState::hide, StepText::Kind::Hide);
}

void MenuHiding::showSelectedAgain()
{
    mark(&EntryState::showAgain, StepText::Kind::ShowAgain);
}

// The history tells what was done.
void MenuHiding::mark(bool (*change)(const QString &path), StepText::Kind kind)
{
    const QString path = selectedEntry();
    if (path.isEmpty())
        return;
    const QString name = m_history.nameOf(path);
    const std::unique_ptr<StepRecorder> recorder = m_history.record();
    if (recorder)
        recorder->mayWrite(path);
    if (!change(path)) {
        m_voice.tell(
            QCoreApplication::translate("VelMenuView", "'%1' was not changed: the file %2 cannot be written.")
                .arg(name, path),
            MenuVoice::Failure);
        return;
    }
    m_find.clear();
    m_menu.files().forgetItemInfo(path);
    const QPointer<MenuHiding> self(this);
    m_history.add(recorder, StepText(kind, name), {path});
    if (self)
        Q_EMIT changed();
}
