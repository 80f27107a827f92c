// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// Says what a host finds at run time: a text of the library in the user's language, the folder of
// the pictures, and whether there is a page of help.

#include <VelRadioGroupBox.h>
#include <velcore/dirs.h>
#include <velintegration/help.h>

#include <QApplication>

#include <cstdio>

int main(int argc, char **argv)
{
    QApplication application(argc, argv);
    VelRadioGroupBox box(QCoreApplication::translate("VelDesktopEntryEditDialog", "Desktop Entry Editor"));
    std::puts(box.title().toUtf8().constData());
    std::puts(GetVelDir(VelDir::Pictures).c_str());
    std::puts(velHelpShow(std::string()) ? "help" : "no help");
    return 0;
}
