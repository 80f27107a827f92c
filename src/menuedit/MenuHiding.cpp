// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuHiding.h"

#include "EntryState.h"
#include "FewLines.h"
#include "MenuFind.h"
#include "MenuHistory.h"
#include "MenuSelection.h"
#include "MenuVoice.h"
#include "ShownMenu.h"
#include "StepRecorder.h"
#include "StepText.h"
#include "TreeOrder.h"
#include "VelMenuModel.h"
#include "VelMenuProxyModel.h"

#include <frame/DesktopEntryRecord.h>
#include <frame/EntryPath.h>

#include <QAction>
#include <QCoreApplication>
#include <QFileInfo>
#include <QMenu>

#include <algorithm>

namespace {

// Whether the entry itself says that the menu is not to show it.
bool isMarkedBy(EntryState::Kind state)
{
    return EntryState::isOutsideMenu(state) && state != EntryState::Kind::NotInstalled;
}

} // namespace

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

// Folders and other files among what is selected stay as they are.
QStringList MenuHiding::selectedEntries() const
{
    QStringList entries;
    const QModelIndexList rows = TreeOrder::fromTop(m_selection.all());
    for (const QModelIndex &row : rows) {
        const QString path = m_menu.files().filePath(m_menu.proxy().mapToSource(row));
        if (EntryPath::isEntry(path) && QFileInfo(path).isFile())
            entries.append(path);
    }
    return entries;
}

// Of several entries some may be hidden and others not.
void MenuHiding::update()
{
    const QStringList paths = selectedEntries();
    bool isAnyShown = paths.isEmpty();
    bool isAnyMarked = false;
    bool canHide = false;
    bool canShow = false;
    for (const QString &path : paths) {
        const EntryState::Kind state = EntryState::of(VelUIDesktopEntry(path));
        const bool isMarked = isMarkedBy(state);
        const bool isWritable =
            state != EntryState::Kind::Malformed && QFileInfo(QFileInfo(path).absolutePath()).isWritable();
        (isMarked ? isAnyMarked : isAnyShown) = true;
        canHide = canHide || (!isMarked && isWritable);
        canShow = canShow || (isMarked && isWritable);
        if (canHide && canShow)
            break;
    }
    m_hide->setVisible(isAnyShown);
    m_showAgain->setVisible(isAnyMarked);
    m_hide->setEnabled(canHide);
    m_showAgain->setEnabled(canShow);
}

void MenuHiding::hideSelected()
{
    mark(&EntryState::hide, false);
}

void MenuHiding::showSelectedAgain()
{
    mark(&EntryState::showAgain, true);
}

// Of several entries those that are not so already.
void MenuHiding::mark(bool (*change)(const QString &path), bool isShown)
{
    QStringList paths = selectedEntries();
    if (paths.size() > 1)
        paths.erase(std::remove_if(paths.begin(), paths.end(),
                                   [isShown](const QString &path) {
                                       return isMarkedBy(EntryState::of(VelUIDesktopEntry(path))) != isShown;
                                   }),
                    paths.end());
    const std::unique_ptr<StepRecorder> recorder = m_history.record();
    QStringList done;
    QStringList complaints;
    QString name;
    for (const QString &path : qAsConst(paths)) {
        const QString itsName = m_history.nameOf(path);
        if (recorder)
            recorder->mayWrite(path);
        if (!change(path)) {
            complaints.append(QCoreApplication::translate(
                                  "VelMenuView", "'%1' was not changed: the file %2 cannot be written.")
                                  .arg(itsName, path));
            continue;
        }
        name = itsName;
        m_menu.files().forgetItemInfo(path);
        done.append(path);
    }
    finish(recorder, done, name, isShown, complaints);
}

// The history tells what was done.
void MenuHiding::finish(const std::unique_ptr<StepRecorder> &recorder, const QStringList &done,
                        const QString &name, bool isShown, const QStringList &complaints)
{
    using Kind = StepText::Kind;
    const QPointer<MenuHiding> self(this);
    MenuVoice::Subject subject = MenuVoice::Subject::Other;
    if (!done.isEmpty()) {
        m_find.clear();
        subject = m_history.add(recorder,
                                done.size() == 1 ? StepText(isShown ? Kind::ShowAgain : Kind::Hide, name)
                                                 : StepText(isShown ? Kind::ShowItemsAgain : Kind::HideItems,
                                                            QString(), done.size()),
                                done);
        if (self)
            Q_EMIT changed();
    }
    if (self && !complaints.isEmpty())
        m_voice.tell(FewLines::of(complaints), MenuVoice::Failure, QModelIndex(), subject);
}
