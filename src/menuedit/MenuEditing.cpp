// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuEditing.h"

#include "EntryDisplay.h"
#include "FileWork.h"
#include "MenuFind.h"
#include "MenuHistory.h"
#include "MenuSelection.h"
#include "MenuVoice.h"
#include "ShownMenu.h"
#include "StepRecorder.h"
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

// Takes an item away that was only just created; why it is still there, else an empty text. A folder
// may hold by now what others put into it, and stays then.
QString takeBack(const QString &path, FreeName::Kind kind)
{
    const bool isEntry = kind == FreeName::Kind::Entry;
    QFile record(isEntry ? path : EntryPath::recordFileOf(path));
    const bool isGone = record.remove() || !record.exists();
    if (!isEntry)
        QDir().rmdir(path);
    return isGone ? QString() : record.errorString();
}

QString textOfWhatStays(const QString &path, const QString &left, const QString &reason)
{
    return left == path ? QCoreApplication::translate(
                              "VelMenuView",
                              "%1 could not be deleted: %2. Make sure that the folder that holds it may "
                              "be written, then try again.")
                              .arg(path, reason)
                        : QCoreApplication::translate(
                              "VelMenuView",
                              "%1 was deleted in part only, because %2 could not be deleted: %3. Make sure "
                              "that its folder may be written, then delete the rest.")
                              .arg(path, left, reason);
}

// Removes the item, with a window that tells when it takes long.
TreeRemoval::Result removeTree(QWidget *view, const QString &path)
{
    FileWork work(view, QCoreApplication::translate("VelMenuView", "Delete"),
                  QCoreApplication::translate("VelMenuView", "Deleting files..."));
    return TreeRemoval::remove(QFile::encodeName(path).toStdString(), work);
}

} // namespace

MenuEditing::MenuEditing(QTreeView *view, const ShownMenu &menu, MenuSelection &selection, MenuFind &find,
                         MenuVoice &voice, MenuHistory &history)
    : m_view(view)
    , m_menu(menu)
    , m_selection(selection)
    , m_find(find)
    , m_voice(voice)
    , m_history(history)
{
}

MenuEditing::~MenuEditing() = default;

bool MenuEditing::createNew(FreeName::Kind kind)
{
    const QString folder = selectedFolder();
    if (!QFileInfo(folder).isDir()) {
        tell(QCoreApplication::translate("VelMenuView",
                                         "Nothing can be created in %1, because there is no such folder.")
                 .arg(folder));
        return false;
    }
    const FreeName::Name name = FreeName::firstIn(folder, kind);
    const QString path = folder + QLatin1Char('/') + name.fileName;

    const QPointer<MenuEditing> self(this);
    const std::unique_ptr<StepRecorder> recorder = m_history.record();
    if (recorder)
        recorder->mayMake(path);
    const bool isWritten = writeNew(path, kind, name.number);
    QString complaint;
    const bool kept = isWritten && offerNew(path, kind, &complaint);
    if (!isWritten)
        complaint =
            QCoreApplication::translate("VelMenuView",
                                        "%1 could not be saved. Make sure that the folder %2 may be written "
                                        "and that the disk is not full, then try again.")
                .arg(path, folder);
    MenuVoice::Subject subject = MenuVoice::Subject::Other;
    if (self)
        subject = m_history.add(recorder, StepText(StepText::Kind::Create, m_history.nameOf(path)), {path});
    if (self)
        Q_EMIT changed();
    if (self && !complaint.isEmpty())
        m_voice.tell(complaint, MenuVoice::Failure, m_selection.shown(path), subject);
    return kept;
}

// The selected folder, or the one that the selected item lies in, whether or not it is still there.
QString MenuEditing::selectedFolder() const
{
    QModelIndex place = m_selection.item();
    if (!place.isValid())
        place = m_menu.proxy().mapToSource(m_view->rootIndex());
    if (!place.isValid())
        return QDir::cleanPath(QFileInfo(m_menu.directory()).absoluteFilePath());
    const QString path = m_menu.files().filePath(place);
    return m_menu.files().isDir(place) ? path : QFileInfo(path).absolutePath();
}

// Writes the record of a new item; false when it cannot be saved.
bool MenuEditing::writeNew(const QString &path, FreeName::Kind kind, const QString &number)
{
    const bool isFolder = kind == FreeName::Kind::Folder;
    // Something else may have been here that nobody saw go.
    m_menu.files().forgetItemInfo(path);
    if (isFolder) {
        m_menu.proxy().invalidateSortOrder(path);
        if (!QDir().mkdir(path))
            return false;
    }
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

// Opens the editor on a new item and takes the item away again unless it is accepted; what the user is to
// hear when it stays.
bool MenuEditing::offerNew(const QString &path, FreeName::Kind kind, QString *complaint)
{
    m_find.clear();
    m_selection.show(path);
    const QPointer<MenuEditing> self(this);
    if (openEditor(path))
        return true;
    const QString whyNotGone = takeBack(path, kind);
    if (!self)
        return false;
    m_menu.files().forgetItemInfo(path);
    m_selection.leave(path);
    if (!whyNotGone.isEmpty())
        *complaint = textOfWhatStays(path, path, whyNotGone);
    return false;
}

bool MenuEditing::edit(const QString &path)
{
    const QPointer<MenuEditing> self(this);
    const std::unique_ptr<StepRecorder> recorder = m_history.record();
    if (recorder)
        recorder->mayWrite(QFileInfo(path).isDir() ? EntryPath::recordFileOf(path) : path);
    const bool isSaved = openEditor(path);
    if (self)
        m_history.add(recorder, StepText(StepText::Kind::Edit, m_history.nameOf(path)), {path});
    return isSaved;
}

bool MenuEditing::openEditor(const QString &path)
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
    dialog->setAssistance(m_isAssisted);
    if (!dialog->setDesktopEntryPath(recordPath, !QFileInfo::exists(recordPath), QString())
        || !dialog.isAlive())
        return false;
    dialog->setWindowTitle(QCoreApplication::translate("VelMenuView", "Desktop Entry %1").arg(recordPath));
    if (!dialog.run())
        return false;
    if (self) {
        m_find.clear();
        m_menu.files().forgetItemInfo(recordPath);
        if (isFolder)
            m_menu.files().forgetItemInfo(path);
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
    const TreeRemoval::Result result = removeTree(m_view, path);
    if (!self)
        return;
    m_menu.files().forgetItemInfo(path);
    m_find.clear();
    m_selection.leave(path);
    Q_EMIT changed();
    if (self && result.error == std::errc::operation_canceled)
        m_voice.tell(
            QCoreApplication::translate("VelMenuView",
                                        "The deletion of %1 was canceled. What was not yet deleted is "
                                        "still there.")
                .arg(path),
            MenuVoice::Warning, m_selection.shown(path));
    else if (self && !result.succeeded())
        tell(textOfWhatStays(path, QFile::decodeName(result.path.c_str()),
                             QString::fromLocal8Bit(result.error.message().c_str())),
             m_selection.shown(path));
}

void MenuEditing::tell(const QString &text, const QModelIndex &at)
{
    m_voice.tell(text, MenuVoice::Failure, at);
}
