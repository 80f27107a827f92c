// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// The other process in tests of settings files:
//
//   settings_writer [--limit BYTES] [--drop-root] FILE OPERATION...
//
// KEY=VALUE sets a string, -KEY removes a key, "sync" syncs, "count PREFIX N" sets N keys, each
// with a sync of its own, "grow" rewrites the file with values of many sizes until it is killed.
// Prints "parsed" or "failed" once the file is open.

#include <VelSettings.h>

#include <QCoreApplication>
#include <QStringList>

#include <csignal>
#include <cstdio>

#include <sys/resource.h>
#include <unistd.h>

namespace {

// From here on no file can grow beyond this size, as on a full disk.
void limitFileSize(rlim_t bytes)
{
    std::signal(SIGXFSZ, SIG_IGN);
    const rlimit limit = {bytes, bytes};
    setrlimit(RLIMIT_FSIZE, &limit);
}

bool dropRoot()
{
    constexpr uid_t nobody = 65534;
    return geteuid() != 0 || (setgid(nobody) == 0 && setuid(nobody) == 0);
}

void countUp(VelSettings &settings, const QString &prefix, int count)
{
    for (int i = 0; i < count; ++i) {
        settings.setValue(prefix + QString::number(i), i);
        settings.sync();
    }
}

[[noreturn]] void grow(VelSettings &settings)
{
    for (int i = 0;; ++i) {
        const int length = (i * 7919) % 300000;
        settings.setValue(QStringLiteral("length"), length);
        settings.setValue(QStringLiteral("text"), QString(length, QLatin1Char('x')));
        settings.sync();
    }
}

void perform(VelSettings &settings, QStringList operations)
{
    while (!operations.isEmpty()) {
        const QString operation = operations.takeFirst();
        if (operation == QLatin1String("sync")) {
            settings.sync();
        } else if (operation == QLatin1String("count")) {
            const QString prefix = operations.takeFirst();
            countUp(settings, prefix, operations.takeFirst().toInt());
        } else if (operation == QLatin1String("grow")) {
            grow(settings);
        } else if (operation.startsWith(QLatin1Char('-'))) {
            settings.remove(operation.mid(1));
        } else {
            settings.setValue(operation.section(QLatin1Char('='), 0, 0),
                              operation.section(QLatin1Char('='), 1));
        }
    }
}

} // namespace

int main(int argc, char **argv)
{
    QCoreApplication application(argc, argv);
    QStringList arguments = QCoreApplication::arguments().mid(1);
    while (arguments.value(0).startsWith(QLatin1String("--"))) {
        const QString option = arguments.takeFirst();
        if (option == QLatin1String("--limit"))
            limitFileSize(rlim_t(arguments.takeFirst().toULongLong()));
        else if (!dropRoot())
            return 2;
    }
    VelSettings settings(arguments.takeFirst());
    std::puts(settings.isParsed() ? "parsed" : "failed");
    std::fflush(stdout);
    perform(settings, arguments);
    return 0;
}
