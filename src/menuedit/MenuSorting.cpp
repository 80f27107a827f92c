// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuSorting.h"

#include "ItemOrder.h"
#include "MenuFind.h"
#include "MenuHistory.h"
#include "MenuReordering.h"
#include "MenuSelection.h"
#include "MenuVoice.h"
#include "ShownMenu.h"
#include "StepRecorder.h"
#include "VelMenuModel.h"
#include "VelMenuProxyModel.h"

#include <frame/DesktopEntryRecord.h>
#include <frame/EntryPath.h>
#include <frame/FolderListing.h>

#include <QAction>
#include <QCoreApplication>
#include <QDir>
#include <QFileInfo>
#include <QIcon>
#include <QMenu>

namespace {

bool isSortable(const QString &folder)
{
    const QFileInfo info(folder);
    return info.isDir() && info.isWritable() && ItemOrder::ruleOf(info.fileName()) == ItemOrder::Rule::ByList;
}

} // namespace

MenuSorting::MenuSorting(const ShownMenu &menu, MenuSelection &selection, MenuFind &find, MenuVoice &voice,
                         MenuHistory &history)
    : m_menu(menu)
    , m_selection(selection)
    , m_find(find)
    , m_voice(voice)
    , m_history(history)
    , m_action(new QAction(QIcon::fromTheme(QStringLiteral("view-sort-ascending")),
                           QCoreApplication::translate("VelMenuView", "&Sort by name"), this))
{
    m_action->setObjectName(QStringLiteral("sortAction"));
    connect(m_action, &QAction::triggered, this, &MenuSorting::sort);
}

MenuSorting::~MenuSorting() = default;

void MenuSorting::setContextMenu(QMenu *menu)
{
    if (m_contextMenu) {
        m_contextMenu->disconnect(this);
        m_contextMenu->removeAction(m_action);
    }
    m_contextMenu = menu;
    if (!menu)
        return;
    menu->addAction(m_action);
    connect(menu, &QMenu::aboutToShow, this, &MenuSorting::update);
}

void MenuSorting::update()
{
    m_action->setEnabled(isSortable(folder()));
}

QString MenuSorting::folder() const
{
    const QModelIndex item = m_selection.item();
    if (!item.isValid())
        return QDir::cleanPath(m_menu.files().menuDirectory());
    const QString path = m_menu.files().filePath(item);
    return m_menu.files().isDir(item) ? path : QFileInfo(path).path();
}

// From disk: nobody may have opened the folder.
QVector<NameOrder::Child> MenuSorting::childrenOf(const QString &folder) const
{
    QVector<NameOrder::Child> children;
    const QSet<QString> names = FolderListing::namesIn(folder).value_or(QSet<QString>());
    for (const QString &name : names) {
        const QString path = folder + QLatin1Char('/') + name;
        const QFileInfo info(path);
        if (name.startsWith(QLatin1Char('.')) || !info.exists())
            continue;
        const RowCache::Display display = m_menu.files().displayOf(path, info.isDir());
        if (!display.isHidden || m_menu.proxy().isHiddenShown())
            children.append({name, display.name.isEmpty() ? name : display.name, info.isDir()});
    }
    return children;
}

void MenuSorting::sort()
{
    const QString folder = this->folder();
    if (!isSortable(folder))
        return;
    const QVector<NameOrder::Child> children = childrenOf(folder);
    const QStringList sorted = NameOrder::sorted(children);
    const QString record = EntryPath::recordFileOf(folder);
    const QString name = m_history.nameOf(folder);
    if (sorted == NameOrder::shown(children, SortOrder::Index(VelUIDesktopEntry(record).getSortOrder()))) {
        m_voice.tell(
            QCoreApplication::translate("VelMenuView", "The folder %1 is sorted by name already.").arg(name),
            MenuVoice::Note);
        return;
    }
    const std::unique_ptr<StepRecorder> recorder = m_history.record();
    if (recorder)
        recorder->mayWrite(record);
    const QPointer<MenuSorting> self(this);
    MenuReordering::write(m_menu, m_voice, folder, SortOrder::rewritten(sorted, QString(), -1));
    if (!self)
        return;
    m_menu.proxy().invalidateSortOrder(folder);
    m_find.clear();
    if (!m_selection.path().isEmpty())
        m_selection.reveal(m_selection.path());
    m_history.add(recorder, StepText(StepText::Kind::Sort, name), m_selection.paths());
    if (self)
        Q_EMIT changed();
}
