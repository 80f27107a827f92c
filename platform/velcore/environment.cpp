// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "environment.h"

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

std::string homeDirectory()
{
    std::string home = absoluteVariable("HOME");
    if (!home.empty())
        return home;
    const std::string registered = homeOfTheUserDataBase();
    return registered.empty() ? std::string("/") : withoutTrailingSlash(registered);
}

std::string xdgConfigHome()
{
    std::string configHome = absoluteVariable("XDG_CONFIG_HOME");
    if (!configHome.empty())
        return configHome;
    const std::string home = homeDirectory();
    return (home == "/" ? std::string() : home) + "/.config";
}
