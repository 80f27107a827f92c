// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// Lets the user pick an entry of the start menu and prints the command that runs it.

#include <VelMenuDialog.h>
#include <velcore/dirs.h>
#include <velintegration/startmenu.h>

#include <QApplication>
#include <QTextStream>

int main(int argc, char **argv)
{
    QApplication application(argc, argv);
    // Makes the start menu of a new home, and has it follow the applications that are installed.
    UpdateStartMenu(GetVelDir(VelDir::StartMenu).c_str(), nullptr);
    VelMenuDialog dialog; // the start menu, read-only, with Ok and Cancel
    if (dialog.exec() != QDialog::Accepted)
        return 1;

    QTextStream out(stdout);
    out << dialog.selectedItemPath() << '\n'
        << dialog.selectedItemExec(QString(), QString(), nullptr, nullptr) << '\n';
    return 0;
}
