// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// A file list with the desktop's icons.

#include <VelMimeTypeIconProvider.h>

#include <QApplication>
#include <QDir>
#include <QFileSystemModel>
#include <QListView>

int main(int argc, char **argv)
{
    QApplication application(argc, argv);
    VelMimeTypeIconProvider icons; // the model does not own it, so it has to outlive the model
    QFileSystemModel model;
    model.setIconProvider(&icons);

    QListView view;
    view.setModel(&model);
    view.setRootIndex(model.setRootPath(application.arguments().value(1, QDir::homePath())));
    view.resize(480, 360);
    view.show();
    return application.exec();
}
