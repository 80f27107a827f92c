// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// vel-menusync [--watch] [MENU]: has the start menu follow the applications that are installed.

#include "MenuWatch.h"

#include <velcore/dirs.h>
#include <velintegration/startmenufollowing.h>
#include <velintegration/wmcommand.h>

#include <cstdio>
#include <string>

#include <X11/Xlib.h>

namespace {

constexpr char Usage[] = "usage: vel-menusync [--watch] [MENU]\n"
                         "Has the start menu follow the applications that are installed, once or, with\n"
                         "--watch, whenever they change. Another menu directory may be given.\n";

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

bool update(const std::string &menu, Look look)
{
    const Result result = VelStartMenu::update(menu.c_str(), nullptr, look);
    if (result == Result::Changed)
        tellWindowManager(menu);
    return result != Result::Failed;
}

// What cannot be done now may be possible later, so it is tried again at the next change.
int watch(const std::string &menu)
{
    const auto follow = [&menu] { update(menu, Look::Files); };
    return MenuWatch(follow).run() ? 0 : fail("cannot watch the folders of the applications");
}

int updateOnce(const std::string &menu)
{
    return update(menu, Look::Folders)
        ? 0
        : fail("cannot update the start menu " + menu + ", or no application is installed");
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
