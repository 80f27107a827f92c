// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FuzzTarget.h"

#include <QDir>
#include <QFile>
#include <QGuiApplication>
#include <QTemporaryDir>

#include <clocale>
#include <cstdint>
#include <cstdio>
#include <cstdlib>

#include <unistd.h>

namespace {

QTemporaryDir &temporaryFolder()
{
    static QTemporaryDir folder(QDir::tempPath() + QStringLiteral("/velfuzz-XXXXXX"));
    return folder;
}

void setUpEnvironment()
{
    const QByteArray home = QFile::encodeName(Fuzz::folder());
    for (const char *variable :
         {"HOME", "XDG_CONFIG_HOME", "XDG_DATA_HOME", "XDG_CACHE_HOME", "XDG_RUNTIME_DIR"})
        qputenv(variable, home);
    for (const char *variable : {"LANGUAGE", "LC_ALL", "LC_MESSAGES", "VEL_CONFIG_HOME", "VEL_SESSION"})
        qunsetenv(variable);
    qputenv("QT_QPA_PLATFORM", "offscreen");
    qputenv("LC_CTYPE", "C.UTF-8");
    // Records are read in a language that the seeds have.
    qputenv("LANG", "de_DE.UTF-8");
    std::setlocale(LC_CTYPE, "C.UTF-8");
}

// What the code under test tells its users would fill the log; what the fuzzer itself and the
// sanitizers have to say does not come this way.
void silence()
{
    qInstallMessageHandler([](QtMsgType, const QMessageLogContext &, const QString &) {});
    if (FILE *nowhere = std::fopen("/dev/null", "w"))
        stderr = nowhere;
}

} // namespace

void Fuzz::require(bool holds, const char *what)
{
    if (holds)
        return;
    dprintf(STDERR_FILENO, "FINDING: %s\n", what);
    std::abort();
}

Fuzz::Parts Fuzz::cut(const QByteArray &input)
{
    const int end = input.indexOf('\n');
    return end < 0 ? Parts{input, QByteArray()} : Parts{input.left(end), input.mid(end + 1)};
}

QString Fuzz::folder()
{
    return temporaryFolder().path();
}

QString Fuzz::write(const char *name, const QByteArray &bytes)
{
    const QString path = folder() + QLatin1Char('/') + QLatin1String(name);
    QFile file(path);
    require(file.open(QIODevice::WriteOnly) && file.write(bytes) == bytes.size() && file.flush(),
            "the input can be written to a file");
    return path;
}

QByteArray Fuzz::read(const QString &path)
{
    QFile file(path);
    require(file.open(QIODevice::ReadOnly), "the file is there and can be read");
    return file.readAll();
}

extern "C" int LLVMFuzzerInitialize(int *argc, char ***argv)
{
    setUpEnvironment();
    silence();
    static int count = 1;
    static QGuiApplication application(count, *argv);
    Q_UNUSED(argc)
    return 0;
}

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *bytes, std::size_t size)
{
    Fuzz::test(QByteArray(reinterpret_cast<const char *>(bytes), int(size)));
    return 0;
}
