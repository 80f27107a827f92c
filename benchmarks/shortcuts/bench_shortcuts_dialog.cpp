// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// The dialog that edits shortcuts, from nothing to a painted window.
//
// Both are given what an application keeps its actions in anyway, a ShortcutsModel and a
// KActionCollection; making these is not measured. There is an icon theme, as on any desktop:
// without one neither dialog has icons on its buttons.

#include "Comparison.h"
#include "EditShortcutsDialog.h"
#include "ShortcutsModel.h"

#include <KActionCollection>
#include <KShortcutsDialog>

#include <QAction>
#include <QApplication>
#include <QDir>
#include <QIcon>
#include <QTemporaryDir>
#include <QTreeView>

#include <algorithm>
#include <cstdio>
#include <memory>
#include <vector>

namespace {

// The same actions for both: in ten groups, three of four with a key.
struct Application
{
    explicit Application(int count)
        : collection(&owner, QStringLiteral("bench"))
        , model(nullptr, QString())
    {
        for (int i = 0; i < count; ++i) {
            const QString name = QStringLiteral("action-%1").arg(i, 5, 10, QLatin1Char('0'));
            auto *action = new QAction(QStringLiteral("&Do the thing number %1").arg(i), &owner);
            const int modifiers = (i / 26 % 2 ? int(Qt::CTRL) : 0) | (i / 52 % 2 ? int(Qt::ALT) : 0)
                | (i / 104 % 2 ? int(Qt::SHIFT) : 0);
            if (i % 4 != 0)
                action->setShortcut(
                    QKeySequence(int(Qt::META) | modifiers | (Qt::Key_A + i % 26), Qt::Key_0 + i / 208));
            collection.addAction(name, action);
            model.registerAction(name, action, QStringLiteral("Group %1").arg(i % 10));
        }
    }

    QObject owner;
    KActionCollection collection;
    ShortcutsModel model;
};

class PaintWatcher : public QObject
{
public:
    bool painted = false;

    bool eventFilter(QObject *watched, QEvent *event) override
    {
        painted = painted || event->type() == QEvent::Paint;
        return QObject::eventFilter(watched, event);
    }
};

void showUntilPainted(QDialog *dialog)
{
    PaintWatcher watcher;
    const auto trees = dialog->findChildren<QTreeView *>();
    for (QTreeView *tree : trees)
        tree->viewport()->installEventFilter(&watcher);
    dialog->show();
    while (!watcher.painted)
        QCoreApplication::processEvents(QEventLoop::WaitForMoreEvents);
    QCoreApplication::processEvents();
}

void showOurs(Application *application)
{
    EditShortcutsDialog dialog(&application->model);
    showUntilPainted(&dialog);
}

void showAssisted(Application *application)
{
    EditShortcutsDialog dialog(&application->model);
    dialog.setAssistance(true);
    showUntilPainted(&dialog);
}

void showPeer(Application *application)
{
    KShortcutsDialog dialog;
    dialog.addCollection(&application->collection);
    showUntilPainted(&dialog);
}

bool compare(const char *title, Application *application, double limit)
{
    Comparison comparison(title);
    comparison.add("EditShortcutsDialog", [application] { showOurs(application); });
    comparison.add(
        "KShortcutsDialog", [application] { showPeer(application); }, limit);
    return comparison.run(9);
}

bool compareAssisted(const char *title, Application *application)
{
    Comparison comparison(title);
    comparison.add("with assistance", [application] { showAssisted(application); });
    comparison.add(
        "without", [application] { showOurs(application); }, 1.3);
    return comparison.run(31);
}

} // namespace

int main(int argc, char **argv)
{
    const QTemporaryDir home;
    for (const char *variable : {"HOME", "XDG_CONFIG_HOME", "XDG_CACHE_HOME", "VEL_CONFIG_HOME"})
        qputenv(variable, QFile::encodeName(home.path()));
    QIcon::setThemeName(QStringLiteral("breeze"));
    QApplication application(argc, argv);
    Application small(500);
    Application large(2000);
    showOurs(&small);
    showPeer(&small);

    bool kept = compare("shortcut dialog, 500 actions", &small, 0.20);
    kept = compare("shortcut dialog, 2,000 actions", &large, 0.12) && kept;

    kept = compareAssisted("shortcut dialog with assistance, 500 actions", &small) && kept;
    kept = compareAssisted("shortcut dialog with assistance, 2,000 actions", &large) && kept;

    Comparison growth("shortcut dialog: 2,000 actions against 500");
    growth.add("2,000 actions", [&large] { showOurs(&large); });
    growth.add(
        "500 actions", [&small] { showOurs(&small); }, 1.5);
    kept = growth.run(15) && kept;
    return kept ? 0 : 1;
}
