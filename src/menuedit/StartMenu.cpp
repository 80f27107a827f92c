// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "StartMenu.h"

#include "MenuVoice.h"
#include "WaitCursor.h"

#include <frame/DesktopEntryRecord.h>
#include <frame/EntryPath.h>
#include <frame/FolderListing.h>
#include <frame/MessageBox.h>

#include <velcore/dirs.h>
#include <velintegration/startmenu.h>

#include <QFile>
#include <QPointer>
#include <QStandardPaths>

#include <cerrno>

namespace {

QString failureText(int error)
{
    const QString directory = StartMenu::directory();
    if (error == ENODATA)
        return QCoreApplication::translate(
                   "VelMenuView",
                   "The default menu could not be built in %1, because no application is installed. The menu "
                   "was left as it is.")
            .arg(directory);
    if (error == 0)
        return QCoreApplication::translate("VelMenuView",
                                           "The default menu could not be built in %1. The menu was left as "
                                           "it is.")
            .arg(directory);
    return QCoreApplication::translate(
               "VelMenuView", "The default menu could not be built in %1: %2. The menu was left as it is.")
        .arg(directory, qt_error_string(error));
}

bool isApplication(const QString &file)
{
    if (!EntryPath::isEntry(file))
        return false;
    const VelUIDesktopEntry entry(file);
    return entry.getType() == QLatin1String("Application") && entry.isDisplayable(nullptr);
}

// Links to folders are not followed.
bool isAnyApplicationIn(const QString &top)
{
    QStringList folders{top};
    while (!folders.isEmpty()) {
        FolderListing files(folders.takeLast());
        while (const std::optional<FolderListing::Item> file = files.next()) {
            if (file->isFolder && !file->isLink)
                folders.append(file->path);
            else if (!file->isFolder && isApplication(file->path))
                return true;
        }
    }
    return false;
}

} // namespace

QString StartMenu::directory()
{
    return QString::fromStdString(GetVelDir(VelDir::StartMenu));
}

bool StartMenu::isAnyApplicationInstalled()
{
    const QStringList folders = QStandardPaths::standardLocations(QStandardPaths::ApplicationsLocation);
    for (const QString &folder : folders) {
        if (isAnyApplicationIn(folder))
            return true;
    }
    return false;
}

bool StartMenu::recreate(QWidget *asker, MenuVoice &voice, const std::function<void()> &begins)
{
    const QPointer<QWidget> self(asker);
    const auto answer = MessageBox::show(
        asker, QMessageBox::Question, QCoreApplication::translate("VelMenuView", "Warning"),
        QCoreApplication::translate("VelMenuView", "All previous shortcuts\nwill be lost. Are you sure?"),
        QMessageBox::Ok | QMessageBox::Cancel, QMessageBox::Ok);
    if (!self || answer == QMessageBox::Cancel)
        return false;
    int error = 0;
    {
        const WaitCursor waiting;
        begins();
        if (CreateStartMenu(QFile::encodeName(directory()).constData(), nullptr))
            return true;
        error = errno;
    }
    qWarning("VelMenuView: can't create the start menu");
    if (self)
        voice.tell(failureText(error), MenuVoice::Failure);
    return true;
}
