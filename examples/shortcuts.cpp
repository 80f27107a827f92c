// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// A window with two commands whose keys the user can change; they are kept between runs.

#include <EditShortcutsDialog.h>
#include <ShortcutsModel.h>

#include <QAction>
#include <QApplication>
#include <QMainWindow>
#include <QMenu>
#include <QMenuBar>
#include <QSettings>

int main(int argc, char **argv)
{
    QApplication application(argc, argv);
    QCoreApplication::setOrganizationName(QStringLiteral("example"));
    QCoreApplication::setApplicationName(QStringLiteral("shortcuts"));

    QMainWindow window;
    QMenu *menu = window.menuBar()->addMenu(QStringLiteral("&File"));
    QAction *print = menu->addAction(QStringLiteral("&Print"));
    print->setShortcut(QKeySequence(QStringLiteral("Ctrl+P")));
    QAction *quit = menu->addAction(QStringLiteral("&Quit"), &application, &QApplication::quit);
    quit->setShortcut(QKeySequence(QStringLiteral("Ctrl+Q")));

    // The saved keys are read first; each action gets its own when it is registered.
    QSettings settings;
    const QString group = QStringLiteral("Shortcuts");
    ShortcutsModel model(&settings, group);
    model.registerAction(QStringLiteral("print"), print, QStringLiteral("File"));
    model.registerAction(QStringLiteral("quit"), quit, QStringLiteral("File"));

    const QAction *configure = menu->addAction(QStringLiteral("Configure &shortcuts..."));
    QObject::connect(configure, &QAction::triggered, &window, [&] {
        EditShortcutsDialog dialog(&model, &window);
        dialog.setAssistance(true); // a filter, clashes told in words, keys to files and back
        if (dialog.exec() == QDialog::Accepted)
            model.saveKeys(&settings, group); // the library never saves by itself
    });
    window.show();
    return application.exec();
}
