// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// vel-menusync [--watch] [MENU]: has the start menu follow the applications that are installed.

#include "MenuWatch.h"

#include <velcore/dirs.h>
#include <velintegration/startmenufollowing.h>
#include <velintegration/wmcommand.h>

#include <cerrno>
#include <cstdio>
#include <cstring>
#include <string>

#include <X11/Xlib.h>

namespace {

constexpr char Usage[] = "usage: vel-menusync [--watch] [MENU]\n"
                         "Has the start menu follow the applications that are installed, once or, with\n"
                         "--watch, whenever they change. Another menu directory may be given.\n"
                         "\n"
                         "  --watch    Go on until the program is told to end.\n"
                         "  --help     Explain the options.\n"
                         "  --version  Print the version.\n"
                         "\n"
                         "The exit status is 0 when the menu is up to date, 1 when something could not be\n"
                         "done or no application is installed, 2 when the arguments are wrong.\n";

using VelStartMenu::Look;
using VelStartMenu::Result;

int fail(const std::string &reason, int status = 1)
{
    std::fprintf(stderr, "vel-menusync: %s\n", reason.c_str());
    return status;
}

// Who shows the menu may have read it already. There need not be anybody.
void tellWindowManager(const std::string &menu)
{
    if (menu != GetVelDir(VelDir::StartMenu))
        return;
    Display *display = XOpenDisplay(nullptr);
    SendCommandToWM(display, "VELWM_UPDATE_STARTMENU\n");
    if (display)
        XCloseDisplay(display);
}

std::string reasonOf(int error, const std::string &menu)
{
    if (error == ENODATA)
        return "no application is installed";
    const std::string text = "cannot update the start menu " + menu;
    return error == 0 ? text : text + ": " + std::strerror(error);
}

// Why the menu could not be updated; empty when it was.
std::string update(const std::string &menu, Look look)
{
    const Result result = VelStartMenu::update(menu.c_str(), nullptr, look);
    if (result == Result::Failed)
        return reasonOf(errno, menu);
    if (result == Result::Changed)
        tellWindowManager(menu);
    return {};
}

// What cannot be done now may be possible later, so it is tried again at the next change; why, is said once.
int watch(const std::string &menu)
{
    std::string said;
    const auto follow = [&menu, &said] {
        const std::string reason = update(menu, Look::Files);
        if (!reason.empty() && reason != said)
            fail(reason);
        said = reason;
    };
    return MenuWatch(follow).run() ? 0 : fail("cannot watch the folders of the applications");
}

int updateOnce(const std::string &menu)
{
    const std::string reason = update(menu, Look::Folders);
    return reason.empty() ? 0 : fail(reason);
}

} // namespace

int main(int argc, char **argv)
{
    std::string menu;
    bool isWatching = false;
    for (int i = 1; i < argc; ++i) {
        const std::string argument = argv[i];
        if (argument == "--help") {
            std::fputs(Usage, stdout);
            return 0;
        }
        if (argument == "--version") {
            std::puts("vel-menusync " VEL_VERSION);
            return 0;
        }
        if (argument == "--watch")
            isWatching = true;
        else if (argument.empty() || argument.front() == '-' || !menu.empty())
            return fail("unexpected argument: " + argument + "; usage: vel-menusync [--watch] [MENU]", 2);
        else
            menu = argument;
    }
    if (menu.empty())
        menu = GetVelDir(VelDir::StartMenu);
    return isWatching ? watch(menu) : updateOnce(menu);
}
