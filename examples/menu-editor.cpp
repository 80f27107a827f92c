// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// Edits a menu directory: the one named on the command line, else the start menu.

#include <VelMenuDialog.h>

#include <QApplication>

int main(int argc, char **argv)
{
    QApplication application(argc, argv);
    // Where the size of the dialog is remembered.
    QCoreApplication::setOrganizationName(QStringLiteral("example"));
    QCoreApplication::setApplicationName(QStringLiteral("menu-editor"));

    const QString directory = application.arguments().value(1);
    const int iconSize = 22; // pixels
    const bool editable = true;
    const bool closeOnly = true; // one Close button instead of Ok and Cancel
    VelMenuDialog dialog(directory, iconSize, editable, closeOnly);
    dialog.exec();
    return 0; // the window manager is told when the dialog is destroyed
}
