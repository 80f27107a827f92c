// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// vel-open [--trust] --exec PATH: runs a desktop entry.
//
// A child in a session of its own does the work and tells the outcome through a pipe. The
// parent waits for that, but for no longer than a caller may be kept waiting: what takes its
// time then goes on without it.

#include "EntryRunner.h"

#include <velcore/home.h>

#include <QCoreApplication>
#include <QFile>

#include <cerrno>
#include <chrono>
#include <clocale>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <cwchar>
#include <cwctype>
#include <optional>
#include <string>

#include <fcntl.h>
#include <linux/close_range.h>
#include <poll.h>
#include <sys/syscall.h>
#include <unistd.h>

namespace {

constexpr char Usage[] = "usage: vel-open --exec PATH\n"
                         "       vel-open --trust --exec PATH\n"
                         "Runs a desktop entry, or opens a file or folder.\n"
                         "\n"
                         "An entry that belongs to another user than you and root and is not executable\n"
                         "is run with --trust only, unless it lies in $XDG_DATA_HOME or $XDG_DATA_DIRS.\n"
                         "\n"
                         "  --exec PATH  Run or open this.\n"
                         "  --trust      Run the entry whoever it belongs to.\n"
                         "  --help       Explain the options.\n"
                         "  --version    Print the version.\n"
                         "\n"
                         "The exit status is 0 when it was started, 1 when it was not, 2 when the arguments\n"
                         "are wrong.\n";
constexpr std::chrono::milliseconds LongestWait(1600);
constexpr char Success = '+';

struct Options
{
    const char *path = nullptr; ///< null when the command line is wrong
    Trust trust = Trust::NotGiven;
};

Options optionsOf(int argc, char **argv)
{
    Options options;
    int next = 1;
    if (next < argc && std::strcmp(argv[next], "--trust") == 0) {
        options.trust = Trust::Given;
        ++next;
    }
    if (argc == next + 2 && std::strcmp(argv[next], "--exec") == 0 && *argv[next + 1])
        options.path = argv[next + 1];
    return options;
}

// A terminal obeys control characters; what comes from an entry or a path may hold any. Which they
// are depends on the locale, and so does what is a character at all.
std::string printable(const std::string &text)
{
    std::string result;
    std::mbstate_t state = {};
    for (std::size_t i = 0; i < text.size();) {
        wchar_t character = 0;
        const std::size_t length = std::mbrtowc(&character, text.data() + i, text.size() - i, &state);
        const bool isCharacter = length != 0 && length <= text.size() - i;
        if (isCharacter && !std::iswcntrl(std::wint_t(character)))
            result.append(text, i, length);
        else
            result += '?';
        if (!isCharacter)
            state = {};
        i += isCharacter ? length : 1;
    }
    return result;
}

int fail(const std::string &path, const std::string &reason)
{
    std::fprintf(stderr, "vel-open: %s\n", printable(path + ": " + reason).c_str());
    return 1;
}

// A stream that the caller closed would leave its number to the next file that is opened, which
// would be lost when the streams are replaced.
void openClosedStreams()
{
    int null = 0;
    do {
        null = open("/dev/null", O_RDWR);
    } while (null >= 0 && null < 3);
    if (null >= 3)
        close(null);
}

// Whoever looks for the home finds the same one, the program that is started among them.
void provideHome()
{
    const char *const home = std::getenv("HOME");
    if (!home || *home != '/')
        setenv("HOME", Vel::homeDirectory().c_str(), 1);
}

// The program that is started inherits no file of the caller's.
void closeFilesOnExec()
{
    if (syscall(SYS_close_range, 3u, ~0u, CLOSE_RANGE_CLOEXEC) == 0)
        return;
    const long count = sysconf(_SC_OPEN_MAX);
    for (int descriptor = 3; descriptor < count; ++descriptor)
        fcntl(descriptor, F_SETFD, FD_CLOEXEC);
}

void leaveTheCaller()
{
    setsid();
    const int null = open("/dev/null", O_RDWR);
    for (int stream = 0; stream < 3; ++stream)
        dup2(null, stream);
    if (null > 2)
        close(null);
}

// Does the work and writes the outcome; does not return. Programs that it runs live on.
[[noreturn]] void work(int outcome, int argc, char **argv, const Options &options)
{
    leaveTheCaller();
    const QCoreApplication application(argc, argv);
    const QString reason = runEntry(QFile::decodeName(options.path), options.trust);
    const std::string text = reason.isEmpty() ? std::string(1, Success) : reason.toLocal8Bit().toStdString();
    const ssize_t written = write(outcome, text.data(), text.size());
    _exit(written < 0 ? 1 : 0);
}

// What the child wrote; nothing when it takes longer than a caller may wait.
std::optional<std::string> waitForOutcome(int outcome)
{
    const auto deadline = std::chrono::steady_clock::now() + LongestWait;
    std::string text;
    for (;;) {
        const auto left = std::chrono::duration_cast<std::chrono::milliseconds>(
            deadline - std::chrono::steady_clock::now());
        if (left.count() <= 0)
            return {};
        pollfd descriptor = {outcome, POLLIN, 0};
        if (poll(&descriptor, 1, static_cast<int>(left.count())) <= 0)
            continue;
        char buffer[4096];
        const ssize_t count = read(outcome, buffer, sizeof buffer);
        if (count == 0)
            return text;
        if (count > 0)
            text.append(buffer, static_cast<std::size_t>(count));
    }
}

int run(int argc, char **argv, const Options &options)
{
    const char *const path = options.path;
    closeFilesOnExec();
    int ends[2];
    if (pipe2(ends, O_CLOEXEC) != 0)
        return fail(path, std::strerror(errno));
    const pid_t child = fork();
    if (child < 0)
        return fail(path, std::strerror(errno));
    if (child == 0)
        work(ends[1], argc, argv, options);
    close(ends[1]);
    const std::optional<std::string> outcome = waitForOutcome(ends[0]);
    if (!outcome || *outcome == std::string(1, Success))
        return 0;
    return fail(path, outcome->empty() ? std::string("the start ended unexpectedly") : *outcome);
}

} // namespace

int main(int argc, char **argv)
{
    openClosedStreams();
    provideHome();
    std::setlocale(LC_CTYPE, "");
    if (argc == 2 && std::strcmp(argv[1], "--help") == 0) {
        std::fputs(Usage, stdout);
        return 0;
    }
    if (argc == 2 && std::strcmp(argv[1], "--version") == 0) {
        std::puts("vel-open " VEL_VERSION);
        return 0;
    }
    const Options options = optionsOf(argc, argv);
    if (!options.path) {
        std::fputs("vel-open: no entry given; usage: vel-open [--trust] --exec PATH\n", stderr);
        return 2;
    }
    return run(argc, argv, options);
}
