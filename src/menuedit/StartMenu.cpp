// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "StartMenu.h"

#include "MenuVoice.h"
#include "WaitCursor.h"

#include <frame/MessageBox.h>

#include <velcore/dirs.h>
#include <velintegration/startmenu.h>

#include <QFile>
#include <QPointer>

QString StartMenu::directory()
{
    return QString::fromStdString(GetVelDir(VelDir::StartMenu));
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
    bool isBuilt = false;
    {
        const WaitCursor waiting;
        begins();
        isBuilt = CreateStartMenu(QFile::encodeName(directory()).constData(), nullptr);
    }
    if (isBuilt)
        return true;
    qWarning("VelMenuView: can't create the start menu");
    if (self)
        voice.tell(QCoreApplication::translate("VelMenuView",
                                               "The default menu could not be built in %1. The menu was left "
                                               "as it is.")
                       .arg(directory()),
                   MenuVoice::Failure);
    return true;
}
