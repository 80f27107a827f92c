// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// Says what a host finds at run time: a text of the library in the user's language, the folder of
// the pictures, and whether there are a page of help and an icon of the library's own.

#include <VelMenuView.h>
#include <VelRadioGroupBox.h>
#include <velcore/dirs.h>
#include <velintegration/help.h>

#include <QAction>
#include <QApplication>
#include <QIcon>

#include <cstdio>

int main(int argc, char **argv)
{
    QApplication application(argc, argv);
    VelRadioGroupBox box(QCoreApplication::translate("VelDesktopEntryEditDialog", "Desktop Entry Editor"));
    std::puts(box.title().toUtf8().constData());
    std::puts(GetVelDir(VelDir::Pictures).c_str());
    std::puts(velHelpShow(std::string()) ? "help" : "no help");
    const VelMenuView menu(QString(), -1, true);
    const auto *action = menu.findChild<QAction *>(QStringLiteral("recreateAction"));
    std::puts(action && !action->icon().isNull() ? "icon" : "no icon");
    return 0;
}
