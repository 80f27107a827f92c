// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// The menu editor as it is used, on 10,000 entries whose files are in memory: opened, scrolled,
// searched, all folders opened, one deleted, and that taken back. Says for each of these how long
// the window does not answer at most, in processor time. Needs a display.

#include "FreezeMeter.h"
#include "MenuFiles.h"

#include <VelMenuDialog.h>
#include <VelMenuView.h>

#include <QAction>
#include <QApplication>
#include <QDir>
#include <QElapsedTimer>
#include <QFile>
#include <QIcon>
#include <QInputDialog>
#include <QScrollBar>
#include <QTemporaryDir>

#include <algorithm>
#include <cstdio>
#include <functional>
#include <memory>
#include <vector>

namespace {

constexpr int Rounds = 7;
constexpr double MostFreeze = 150; // milliseconds
constexpr int Folders = 200;
constexpr int EntriesOfEach = 50;

void settle(int forMilliseconds)
{
    QElapsedTimer timer;
    for (timer.start(); timer.elapsed() < forMilliseconds;)
        QCoreApplication::processEvents(QEventLoop::AllEvents, 5);
}

void settleUntil(const char *what, const std::function<bool()> &isReached)
{
    QElapsedTimer timer;
    for (timer.start(); !isReached();) {
        QCoreApplication::processEvents(QEventLoop::AllEvents, 5);
        if (timer.elapsed() > 60000)
            qFatal("%s does not come to an end", what);
    }
    settle(500);
}

struct Step
{
    const char *name;
    std::function<void()> work;
    std::vector<double> freezes;
};

/// One use of the editor.
class Use
{
public:
    explicit Use(QString menu)
        : m_menu(std::move(menu))
    {
    }

    void open()
    {
        m_dialog = std::make_unique<VelMenuDialog>(m_menu, -1, true, true);
        m_dialog->setAssistance(true);
        m_dialog->resize(400, 700);
        m_dialog->show();
        m_view = m_dialog->findChild<VelMenuView *>();
        settleUntil("opening", [this] { return rows() == Folders; });
    }

    void scroll() const
    {
        QScrollBar *bar = m_view->verticalScrollBar();
        for (int turn = 0; turn < 2; ++turn) {
            const auto step = turn == 0 ? QScrollBar::SliderPageStepAdd : QScrollBar::SliderPageStepSub;
            for (int page = 0; page < 400; ++page) {
                bar->triggerAction(step);
                QCoreApplication::processEvents();
            }
        }
    }

    void find() const
    {
        QTimer::singleShot(0, m_view, [] {
            auto *question = qobject_cast<QInputDialog *>(QApplication::activeModalWidget());
            question->setTextValue(QStringLiteral("Needle"));
            question->accept();
        });
        m_view->slotFind();
        settle(500);
        if (!m_view->selectedPath().endsWith(QLatin1String("needle.desktop")))
            std::printf("  the needle was not found\n");
    }

    // As "*" in a tree does it.
    void expandAll() const
    {
        for (int row = 0; row < rows(); ++row)
            m_view->expand(child(row));
        settleUntil("expanding", [this] {
            for (int row = 0; row < rows(); ++row) {
                if (m_view->model()->rowCount(child(row)) < EntriesOfEach)
                    return false;
            }
            return true;
        });
    }

    void deleteFolder() const
    {
        m_view->setCurrentIndex(child(rows() / 2));
        m_view->slotDel();
        settleUntil("deleting", [this] { return rows() == Folders - 1; });
    }

    void undo() const
    {
        m_view->undoAction()->trigger();
        settleUntil("taking back", [this] { return rows() == Folders; });
    }

    void close() { m_dialog.reset(); }

private:
    int rows() const { return m_view->model()->rowCount(m_view->rootIndex()); }
    QModelIndex child(int row) const { return m_view->model()->index(row, 0, m_view->rootIndex()); }

    const QString m_menu;
    std::unique_ptr<VelMenuDialog> m_dialog;
    VelMenuView *m_view = nullptr;
};

bool report(const Step &step)
{
    std::vector<double> sorted = step.freezes;
    std::sort(sorted.begin(), sorted.end());
    const bool isKept = sorted.back() <= MostFreeze;
    std::printf("  %-24s median %7.1f ms, longest %7.1f ms, aim %4.0f ms%s\n", step.name,
                sorted.at(sorted.size() / 2), sorted.back(), MostFreeze, isKept ? "" : " (missed)");
    return isKept;
}

void putNeedle(const QString &menu)
{
    const QString last = QDir(menu).entryInfoList(QDir::Dirs | QDir::NoDotAndDotDot).constLast().filePath();
    QFile needle(last + QLatin1String("/needle.desktop"));
    if (!needle.open(QIODevice::WriteOnly)
        || needle.write("[Desktop Entry]\nType=Application\nName=Needle\nExec=true\n") < 0)
        qFatal("cannot write %s", qPrintable(needle.fileName()));
}

} // namespace

int main(int argc, char **argv)
{
    const QTemporaryDir home;
    for (const char *variable : {"HOME", "XDG_CONFIG_HOME", "XDG_DATA_HOME", "VEL_CONFIG_HOME"})
        qputenv(variable, QFile::encodeName(home.path()));
    QApplication application(argc, argv);
    // Closing the editor closes no more than that.
    QApplication::setQuitOnLastWindowClosed(false);
    QIcon::setThemeSearchPaths({QStringLiteral("/usr/share/icons")});
    QIcon::setThemeName(QStringLiteral("breeze"));
    MenuFiles files;
    const QString menu = files.nested(Folders, EntriesOfEach);
    putNeedle(menu);

    Use use(menu);
    std::vector<Step> steps = {{"open", [&] { use.open(); }, {}},
                               {"scroll", [&] { use.scroll(); }, {}},
                               {"find", [&] { use.find(); }, {}},
                               {"expand all", [&] { use.expandAll(); }, {}},
                               {"scroll through all", [&] { use.scroll(); }, {}},
                               {"delete a folder", [&] { use.deleteFolder(); }, {}},
                               {"take that back", [&] { use.undo(); }, {}},
                               {"close", [&] { use.close(); }, {}}};
    for (int round = 0; round < Rounds; ++round) {
        for (Step &step : steps) {
            FreezeMeter meter;
            step.work();
            step.freezes.push_back(meter.longest());
        }
    }
    std::printf("longest freeze while a menu of 10,000 entries is edited\n");
    bool kept = true;
    for (const Step &step : steps)
        kept = report(step) && kept;
    return kept ? 0 : 1;
}
