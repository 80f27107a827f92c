// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// Finding and filtering in large menus: how long it takes, and how long the window does not answer
// meanwhile. The answer of a search is the time that the user waits; a key and a freeze are
// processor time, so that what else runs on the machine does not count. Needs a display.

#include "FreezeMeter.h"
#include "MenuFiles.h"

#include <VelMenuView.h>

#include <QApplication>
#include <QDir>
#include <QElapsedTimer>
#include <QFile>
#include <QFileInfo>
#include <QIcon>
#include <QInputDialog>
#include <QLineEdit>
#include <QTemporaryDir>
#include <QTimer>

#include <algorithm>
#include <cstdio>
#include <functional>
#include <map>
#include <string>
#include <vector>

namespace {

constexpr double MostAnswer = 1000; // milliseconds, as the others
constexpr double MostFreeze = 200;
constexpr double MostKey = 50;
constexpr int Rounds = 7;

double milliseconds(const QElapsedTimer &timer)
{
    return double(timer.nsecsElapsed()) / 1e6;
}

void settle(int forMilliseconds)
{
    QElapsedTimer timer;
    for (timer.start(); timer.elapsed() < forMilliseconds;)
        QCoreApplication::processEvents(QEventLoop::AllEvents, 5);
}

double median(std::vector<double> values)
{
    std::sort(values.begin(), values.end());
    return values.at(values.size() / 2);
}

bool report(const char *what, const std::vector<double> &values, double most)
{
    const double longest = *std::max_element(values.begin(), values.end());
    std::printf("  %-46s median %7.1f ms, longest %7.1f ms, aim %4.0f ms%s\n", what, median(values), longest,
                most, longest > most ? " (missed)" : "");
    return longest <= most;
}

// The time from the text being entered until the match is selected.
double findOnce(VelMenuView *view, double *freeze)
{
    QElapsedTimer timer;
    QTimer::singleShot(0, view, [&] {
        auto *question = qobject_cast<QInputDialog *>(QApplication::activeModalWidget());
        question->setTextValue(QStringLiteral("Needle"));
        timer.start();
        question->accept();
    });
    FreezeMeter meter;
    view->slotFind();
    const double time = milliseconds(timer);
    if (!view->selectedPath().endsWith(QLatin1String("needle.desktop")))
        std::printf("  the needle was not found\n");
    settle(300);
    *freeze = meter.longest();
    return time;
}

bool measureFind(const char *title, const QString &menu)
{
    std::printf("%s\n", title);
    std::vector<double> times;
    std::vector<double> freezes;
    for (int round = 0; round < Rounds; ++round) {
        VelMenuView view(menu, -1, true);
        view.resize(400, 480);
        view.show();
        settle(500);
        double freeze = 0;
        times.push_back(findOnce(&view, &freeze));
        freezes.push_back(freeze);
    }
    const bool isSoon = report("answer", times, MostAnswer);
    return report("longest freeze", freezes, MostFreeze) && isSoon;
}

// In each round the menu is shown anew, with assistance.
void inEachRound(const QString &menu, const std::function<void(VelMenuView *)> &use)
{
    for (int round = 0; round < Rounds; ++round) {
        VelMenuView view(menu, -1, true);
        view.setAssistance(true);
        view.resize(400, 480);
        view.show();
        settle(1500);
        use(&view);
    }
}

// One key after the other, as somebody types and deletes again.
bool measureFilter(const char *title, const QString &menu)
{
    std::printf("%s\n", title);
    std::vector<double> first;
    std::vector<double> keys;
    std::vector<double> freezes;
    inEachRound(menu, [&](VelMenuView *view) {
        const QString text = QStringLiteral("entry 123");
        FreezeMeter meter;
        for (int length = 1; length <= 2 * text.size(); ++length) {
            const double before = FreezeMeter::processorMilliseconds();
            view->setFilter(text.left(length <= text.size() ? length : 2 * text.size() - length));
            // Until it is painted, too.
            QCoreApplication::processEvents();
            (length == 1 ? first : keys).push_back(FreezeMeter::processorMilliseconds() - before);
            settle(length == 1 ? 1500 : 100);
        }
        freezes.push_back(meter.longest());
    });
    const bool isFirstSoon = report("first key, menu not read yet", first, MostKey);
    const bool isSoon = report("each further key", keys, MostKey);
    return report("longest freeze", freezes, MostFreeze) && isFirstSoon && isSoon;
}

/// Says how long each of several things takes that are done one after the other.
class Course
{
public:
    explicit Course(std::map<std::string, std::vector<double>> *times)
        : m_times(times)
    {
    }

    // Until the window answers again; what comes in the background after that counts as a freeze.
    void measure(const char *what, const std::function<void()> &deed)
    {
        FreezeMeter meter;
        deed();
        QCoreApplication::processEvents();
        settle(1000);
        (*m_times)[what].push_back(meter.longest());
    }

private:
    std::map<std::string, std::vector<double>> *const m_times;
};

// All that a filter finds is selected: what is done to it, and what is typed meanwhile.
void useSeveral(VelMenuView *view, Course *course)
{
    course->measure("filter", [&] { view->setFilter(QStringLiteral("entry 1")); });
    view->expandAll();
    settle(1500);
    course->measure("select all", [&] { view->selectAll(); });
    if (view->selectionModel()->selectedIndexes().size() < 1000)
        std::printf("  too little was found and selected\n");
    course->measure("a key more", [&] { view->setFilter(QStringLiteral("entry 12")); });
    course->measure("a key less", [&] { view->setFilter(QStringLiteral("entry 1")); });
    course->measure("select all again", [&] { view->selectAll(); });
    course->measure("copy", [&] { view->slotCopy(); });
    course->measure("cut", [&] { view->slotCut(); });
    course->measure("down", [&] { view->slotDown(); });
    course->measure("filter taken away", [&] { view->setFilter(QString()); });
    course->measure("one selected",
                    [&] { view->setCurrentIndex(view->model()->index(0, 0, view->rootIndex())); });
}

// Deleting goes by one item after the other, which the user sees; it is not part of this.
bool measureSeveral(const char *title, const QString &menu)
{
    std::printf("%s\n", title);
    std::map<std::string, std::vector<double>> times;
    inEachRound(menu, [&](VelMenuView *view) {
        Course course(&times);
        useSeveral(view, &course);
    });
    bool kept = true;
    for (const auto &[what, freezes] : times)
        kept = report(("longest freeze: " + what).c_str(), freezes, MostFreeze) && kept;
    return kept;
}

} // namespace

int main(int argc, char **argv)
{
    QApplication application(argc, argv);
    QIcon::setThemeSearchPaths({QStringLiteral("/usr/share/icons")});
    QIcon::setThemeName(QStringLiteral("breeze"));
    MenuFiles files;
    const QString menu = files.nested(200, 50);
    const QString last = QDir(menu).entryInfoList(QDir::Dirs | QDir::NoDotAndDotDot).constLast().filePath();
    QFile needle(last + QLatin1String("/needle.desktop"));
    if (!needle.open(QIODevice::WriteOnly)
        || needle.write("[Desktop Entry]\nType=Application\nName=Needle\nExec=true\n") < 0)
        return 2;
    needle.close();
    bool kept = measureFind("find in 10,000 entries", menu);

    // In memory where that can be had: a disk takes minutes to make and to remove it.
    QTemporaryDir large(QFileInfo(QStringLiteral("/dev/shm")).isWritable()
                            ? QStringLiteral("/dev/shm/vel-XXXXXX")
                            : QString());
    for (int i = 0; i < 20000; ++i)
        QDir(large.path()).mkdir(QString::number(i));
    if (!QFile::link(large.path(), menu + QLatin1String("/link")))
        return 2;
    kept = measureFind("find in 10,000 entries beside a link to 20,000 folders", menu) && kept;
    QFile::remove(menu + QLatin1String("/link"));

    kept = measureFilter("filter of 5,000 entries in 100 folders", files.nested(100, 50)) && kept;
    kept = measureFilter("filter of 5,000 entries in one folder", files.flat(5000, false)) && kept;
    kept = measureSeveral("filter and all that it finds selected, of 5,000 in 100 folders",
                          files.nested(100, 50))
        && kept;
    kept = measureSeveral("filter and all that it finds selected, of 5,000 in one folder",
                          files.flat(5000, false))
        && kept;
    return kept ? 0 : 1;
}
