// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "StartMenu.h"

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

bool StartMenu::recreate(QWidget *asker)
{
    const QPointer<QWidget> self(asker);
    const auto answer = MessageBox::show(
        asker, QMessageBox::Question, QCoreApplication::translate("VelMenuView", "Warning"),
        QCoreApplication::translate("VelMenuView", "All previous shortcuts\nwill be lost. Are you sure?"),
        QMessageBox::Ok | QMessageBox::Cancel, QMessageBox::Ok);
    if (!self || answer == QMessageBox::Cancel)
        return false;
    const WaitCursor waiting;
    if (!CreateStartMenu(QFile::encodeName(directory()).constData(), nullptr))
        qWarning("VelMenuView: can't create the start menu");
    return true;
}
