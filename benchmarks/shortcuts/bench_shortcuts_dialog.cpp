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
#include <QDialogButtonBox>
#include <QDir>
#include <QGridLayout>
#include <QGroupBox>
#include <QIcon>
#include <QKeySequenceEdit>
#include <QLabel>
#include <QRadioButton>
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

// The least that such a dialog can be: the same widgets, and a tree that shows all shortcuts.
void showBare(Application *application)
{
    QDialog dialog;
    dialog.setWindowTitle(QStringLiteral("Configure shortcuts"));
    dialog.resize(614, 504);
    auto *layout = new QVBoxLayout(&dialog);
    auto *tree = new QTreeView(&dialog);
    tree->setEditTriggers(QAbstractItemView::NoEditTriggers);
    layout->addWidget(tree);
    auto *box = new QGroupBox(QStringLiteral("Choose a key for selected action"), &dialog);
    auto *grid = new QGridLayout(box);
    grid->addWidget(new QRadioButton(QStringLiteral("Default key:"), box), 0, 0, 2, 1);
    grid->addWidget(new QLabel(box), 0, 1, 2, 2);
    grid->addWidget(new QRadioButton(QStringLiteral("Assign key:"), box), 2, 0);
    auto *key = new QKeySequenceEdit(box);
    key->setEnabled(false);
    grid->addWidget(key, 2, 1, 1, 2);
    box->setEnabled(false);
    layout->addWidget(box);
    layout->addWidget(new QDialogButtonBox(QDialogButtonBox::Ok | QDialogButtonBox::Cancel
                                               | QDialogButtonBox::Reset | QDialogButtonBox::RestoreDefaults,
                                           &dialog));
    tree->setModel(&application->model);
    for (int group = 0; group < application->model.rowCount(); ++group)
        tree->expand(application->model.index(group, 0));
    tree->setColumnWidth(0, 250);
    showUntilPainted(&dialog);
}

bool compareBare(const char *title, Application *application, double limit)
{
    Comparison comparison(title);
    comparison.add("EditShortcutsDialog", [application] { showOurs(application); });
    comparison.add(
        "the same form of plain Qt widgets and a bare tree", [application] { showBare(application); }, limit);
    return comparison.run(61);
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

    kept = compareBare("shortcut dialog beside its widgets, 500 actions", &small, 1.10) && kept;
    kept = compareBare("shortcut dialog beside its widgets, 2,000 actions", &large, 1.20) && kept;

    kept = compareAssisted("shortcut dialog with assistance, 500 actions", &small) && kept;
    kept = compareAssisted("shortcut dialog with assistance, 2,000 actions", &large) && kept;

    Comparison growth("shortcut dialog: 2,000 actions against 500");
    growth.add("2,000 actions", [&large] { showOurs(&large); });
    growth.add(
        "500 actions", [&small] { showOurs(&small); }, 1.5);
    kept = growth.run(15) && kept;
    return kept ? 0 : 1;
}
