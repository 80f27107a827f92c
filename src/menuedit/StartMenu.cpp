// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "StartMenu.h"

#include "MenuVoice.h"
#include "WaitCursor.h"

#include <frame/DesktopEntryRecord.h>
#include <frame/EntryPath.h>
#include <frame/MessageBox.h>

#include <velcore/dirs.h>
#include <velintegration/startmenu.h>

#include <QDirIterator>
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

} // namespace

QString StartMenu::directory()
{
    return QString::fromStdString(GetVelDir(VelDir::StartMenu));
}

bool StartMenu::isAnyApplicationInstalled()
{
    const QStringList folders = QStandardPaths::standardLocations(QStandardPaths::ApplicationsLocation);
    for (const QString &folder : folders) {
        QDirIterator files(folder, QDir::Files, QDirIterator::Subdirectories);
        while (files.hasNext()) {
            const QString file = files.next();
            if (!EntryPath::isEntry(file))
                continue;
            const VelUIDesktopEntry entry(file);
            if (entry.getType() == QLatin1String("Application") && entry.isDisplayable(nullptr))
                return true;
        }
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
