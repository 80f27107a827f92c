// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// startup_probe WHEN LIBRARY
//
// Loads a library at one of several moments and prints, on one line a moment, what a text of the
// library reads and how many of its translators (or of those that failed to load) the application owns.

#include <QCoreApplication>
#include <QTimer>
#include <QTranslator>

#include <dlfcn.h>

#include <cstdio>
#include <cstring>
#include <thread>

namespace {

void say(const char *moment)
{
    // Libraries under ours bring catalogs of their own.
    int count = 0;
    bool onApplicationThread = true;
    for (const QTranslator *translator : qApp->findChildren<QTranslator *>()) {
        if (!translator->filePath().isEmpty()
            && !translator->filePath().contains(QLatin1String("libveluiextra")))
            continue;
        ++count;
        onApplicationThread = onApplicationThread && translator->thread() == qApp->thread();
    }
    std::printf("%s: %s, %d translators%s\n", moment,
                qPrintable(QCoreApplication::translate("VelMenuView", "New entry")), count,
                onApplicationThread ? "" : " on another thread");
}

bool open(const char *library)
{
    if (dlopen(library, RTLD_NOW))
        return true;
    std::fprintf(stderr, "%s\n", dlerror());
    return false;
}

} // namespace

int main(int argc, char **argv)
{
    const char *when = argc > 1 ? argv[1] : "linked";
    const char *library = argc > 2 ? argv[2] : nullptr;
    if (!std::strcmp(when, "before") && !open(library))
        return 1;

    QCoreApplication application(argc, argv);
    if (!std::strcmp(when, "after") && !open(library))
        return 1;
    if (!std::strcmp(when, "worker")) {
        bool opened = false;
        std::thread worker([&] { opened = open(library); });
        worker.join();
        if (!opened)
            return 1;
    }
    say("started");
    QTimer::singleShot(0, [] {
        say("running");
        QCoreApplication::quit();
    });
    return QCoreApplication::exec();
}
