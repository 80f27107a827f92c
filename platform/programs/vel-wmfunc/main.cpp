// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// vel-wmfunc WORDS...: sends a command to the window manager.

#include <velintegration/wmcommand.h>

#include <cstdio>
#include <string>

#include <X11/Xlib.h>

namespace {

constexpr char Usage[] = "usage: vel-wmfunc WORDS...\n"
                         "Sends the words, joined by blanks, to the window manager.\n"
                         "\n"
                         "  --help     Explain the program.\n"
                         "  --version  Print the version.\n"
                         "\n"
                         "The exit status is 0 when the window manager was told, 1 when it was not, 2 when\n"
                         "there is no command.\n";

int fail(const char *reason)
{
    std::fprintf(stderr, "vel-wmfunc: %s\n", reason);
    return 1;
}

int send(const std::string &command)
{
    Display *display = XOpenDisplay(nullptr); // without one it goes over the session bus
    const bool sent = SendCommandToWM(display, command.c_str());
    if (display)
        XCloseDisplay(display);
    if (sent)
        return 0;
    return fail(display ? "no window manager takes commands here"
                        : "there is no display, and no window manager takes commands on the session bus");
}

} // namespace

int main(int argc, char **argv)
{
    const std::string first = argc == 2 ? argv[1] : "";
    if (first == "--help") {
        std::fputs(Usage, stdout);
        return 0;
    }
    if (first == "--version") {
        std::puts("vel-wmfunc " VEL_VERSION);
        return 0;
    }

    std::string command;
    for (int i = 1; i < argc; ++i)
        command += (i > 1 ? " " : "") + std::string(argv[i]);
    if (command.empty()) {
        fail("no command given; usage: vel-wmfunc WORDS...");
        return 2;
    }
    // A line feed ends a command: what follows would be another one.
    if (command.find('\n') != std::string::npos)
        return fail("a command is one line");
    return send(command + '\n');
}
