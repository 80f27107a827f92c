// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "environment.h"

#include <velcore/home.h>

#include <cstdlib>
#include <vector>

#include <pwd.h>
#include <unistd.h>

namespace {

std::string withoutTrailingSlash(std::string path)
{
    while (path.size() > 1 && path.back() == '/')
        path.pop_back();
    return path;
}

std::string homeOfTheUserDataBase()
{
    std::vector<char> buffer(16384);
    passwd entry = {};
    passwd *found = nullptr;
    if (getpwuid_r(getuid(), &entry, buffer.data(), buffer.size(), &found) == 0 && found && found->pw_dir)
        return found->pw_dir;
    return {};
}

} // namespace

std::string variable(const char *name)
{
    const char *value = std::getenv(name);
    return value ? std::string(value) : std::string();
}

std::string absoluteVariable(const char *name)
{
    const std::string value = variable(name);
    return value.empty() || value.front() != '/' ? std::string() : withoutTrailingSlash(value);
}

std::string inHome(const std::string &home, const char *name)
{
    return (home == "/" ? home : home + '/') + name;
}

std::string Vel::homeDirectory()
{
    std::string home = absoluteVariable("HOME");
    if (!home.empty())
        return home;
    const std::string registered = homeOfTheUserDataBase();
    return registered.empty() ? std::string("/") : withoutTrailingSlash(registered);
}

std::string Vel::dataHome()
{
    const std::string dataHome = absoluteVariable("XDG_DATA_HOME");
    return dataHome.empty() ? inHome(homeDirectory(), ".local/share") : dataHome;
}

std::string xdgConfigHome()
{
    const std::string configHome = absoluteVariable("XDG_CONFIG_HOME");
    return configHome.empty() ? inHome(Vel::homeDirectory(), ".config") : configHome;
}
