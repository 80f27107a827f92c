// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// Edits the desktop entry named on the command line, or creates it.

#include <VelDesktopEntryEditDialog.h>

#include <QApplication>
#include <QFileInfo>

int main(int argc, char **argv)
{
    QApplication application(argc, argv);
    if (argc < 2)
        return 2;
    const QString path = QFileInfo(application.arguments().at(1)).absoluteFilePath();
    const bool create = !QFileInfo::exists(path);

    VelDesktopEntryEditDialog dialog;
    if (!dialog.setDesktopEntryPath(path, create))
        return 2; // the user was told why
    return dialog.exec() == QDialog::Accepted ? 0 : 1; // Ok checks and saves
}
