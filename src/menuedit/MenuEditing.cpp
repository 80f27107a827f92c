// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuEditing.h"

#include "EntryDisplay.h"
#include "FileProgress.h"
#include "MenuFind.h"
#include "MenuSelection.h"
#include "ShownMenu.h"
#include "TreeRemoval.h"
#include "VelDesktopEntryEditDialog.h"
#include "VelMenuModel.h"
#include "VelMenuProxyModel.h"

#include <frame/DesktopEntryRecord.h>
#include <frame/EntryPath.h>
#include <frame/GuardedDialog.h>
#include <frame/MessageBox.h>

#include <QCoreApplication>
#include <QDir>
#include <QFileInfo>
#include <QPointer>
#include <QTreeView>

namespace {

// Takes an item away that was only just created.
void takeBack(const QString &path, FreeName::Kind kind)
{
    if (kind == FreeName::Kind::Entry) {
        QFile::remove(path);
        return;
    }
    QFile::remove(EntryPath::recordFileOf(path));
    QDir().rmdir(path);
}

} // namespace

MenuEditing::MenuEditing(QTreeView *view, const ShownMenu &menu, MenuSelection &selection, MenuFind &find,
                         MenuVoice &voice)
    : m_view(view)
    , m_menu(menu)
    , m_selection(selection)
    , m_find(find)
    , m_voice(voice)
{
}

MenuEditing::~MenuEditing() = default;

bool MenuEditing::createNew(FreeName::Kind kind)
{
    const QString folder = selectedFolder();
    if (folder.isEmpty())
        return false;
    const FreeName::Name name = FreeName::firstIn(folder, kind);
    const QString path = folder + QLatin1Char('/') + name.fileName;

    const QPointer<MenuEditing> self(this);
    const bool kept = writeNew(path, kind, name.number) && offerNew(path, kind);
    if (self)
        Q_EMIT changed();
    return kept;
}

// The selected folder, or the one that the selected item lies in; empty when there is none.
QString MenuEditing::selectedFolder() const
{
    QModelIndex place = m_selection.item();
    if (!place.isValid())
        place = m_menu.proxy().mapToSource(m_view->rootIndex());
    if (!place.isValid())
        return QString();
    const QFileInfo info(m_menu.files().filePath(place));
    return info.isDir() ? info.filePath() : info.absolutePath();
}

// Writes the record of a new item; false when it cannot be saved.
bool MenuEditing::writeNew(const QString &path, FreeName::Kind kind, const QString &number)
{
    const bool isFolder = kind == FreeName::Kind::Folder;
    if (isFolder)
        QDir().mkpath(path);
    const QString recordPath = isFolder ? EntryPath::recordFileOf(path) : path;
    VelUIDesktopEntry record(recordPath);
    record.setType(isFolder ? QStringLiteral("Directory") : QStringLiteral("Application"));
    record.setName((isFolder ? QStringLiteral("Group") : QStringLiteral("Shortcut")) + number);
    record.setLocalName((isFolder ? QCoreApplication::translate("VelMenuView", "Group")
                                  : QCoreApplication::translate("VelMenuView", "Shortcut"))
                        + number);
    record.setIcon(isFolder ? QStringLiteral("folder") : QStringLiteral("application-x-executable"));
    if (!record.save())
        return false;
    m_menu.files().setItemName(recordPath, EntryDisplay::shownName(record));
    return true;
}

// Opens the editor on a new item and takes the item away again unless it is accepted.
bool MenuEditing::offerNew(const QString &path, FreeName::Kind kind)
{
    m_find.clear();
    m_selection.show(path);
    const QPointer<MenuEditing> self(this);
    if (edit(path))
        return true;
    takeBack(path, kind);
    if (!self)
        return false;
    m_menu.files().forgetItemInfo(path);
    m_selection.leave(path);
    return false;
}

bool MenuEditing::edit(const QString &path)
{
    if (path.isEmpty())
        return false;
    const bool isFolder = QFileInfo(path).isDir();
    const QString recordPath = isFolder ? EntryPath::recordFileOf(path) : path;
    if (!isFolder && !EntryPath::isEntry(recordPath)) {
        MessageBox::show(m_view, QMessageBox::Warning, QCoreApplication::translate("VelMenuView", "Warning"),
                         QCoreApplication::translate("VelMenuView", "Can't edit non desktop file"));
        return false;
    }

    const QPointer<MenuEditing> self(this);
    GuardedDialog<VelDesktopEntryEditDialog> dialog(m_view);
    if (!dialog->setDesktopEntryPath(recordPath, !QFileInfo::exists(recordPath), QString())
        || !dialog.isAlive())
        return false;
    dialog->setWindowTitle(QCoreApplication::translate("VelMenuView", "Desktop Entry %1").arg(recordPath));
    if (!dialog.run())
        return false;
    if (self) {
        m_find.clear();
        m_menu.files().forgetItemInfo(recordPath);
        Q_EMIT changed();
    }
    return true;
}

void MenuEditing::remove(const QString &path)
{
    if (path.isEmpty())
        return;
    const QPointer<MenuEditing> self(this);
    const auto answer = MessageBox::show(
        m_view, QMessageBox::Question, QCoreApplication::translate("VelMenuView", "Attention"),
        QCoreApplication::translate("VelMenuView", "Are you sure to delete it?"),
        QMessageBox::Yes | QMessageBox::No, QMessageBox::Yes);
    if (!self || answer != QMessageBox::Yes)
        return;
    const QFileInfo info(path);
    // A link to a folder is removed as a file is: what it leads to is not ours to delete.
    FileProgress nobody;
    if (info.isDir() && !info.isSymLink())
        TreeRemoval::remove(QFile::encodeName(path).toStdString(), nobody);
    else
        m_menu.files().remove(m_menu.files().index(path));
    m_menu.files().forgetItemInfo(path);
    m_find.clear();
    m_selection.leave(path);
    Q_EMIT changed();
}
