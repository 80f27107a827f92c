// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "userdirs.h"

#include "environment.h"

#include <velcore/files.h>
#include <velcore/home.h>

#include <sstream>

namespace {

constexpr char DesktopKey[] = "XDG_DESKTOP_DIR";

std::string trimmed(const std::string &text)
{
    const char *blanks = " \t\r";
    const std::size_t first = text.find_first_not_of(blanks);
    if (first == std::string::npos)
        return {};
    return text.substr(first, text.find_last_not_of(blanks) - first + 1);
}

// The value between double quotes, in which a backslash protects the character behind it.
std::string unquoted(const std::string &text)
{
    if (text.empty() || text.front() != '"')
        return {};
    std::string value;
    for (std::size_t i = 1; i < text.size() && text[i] != '"'; ++i) {
        if (text[i] == '\\' && i + 1 < text.size())
            ++i;
        value += text[i];
    }
    return value;
}

// The file knows two forms only: below "$HOME/" and absolute.
std::string resolved(const std::string &value)
{
    const std::string homePrefix = "$HOME";
    std::string path;
    if (value.compare(0, homePrefix.size(), homePrefix) == 0
        && (value.size() == homePrefix.size() || value[homePrefix.size()] == '/')) {
        const std::string home = Vel::homeDirectory();
        path = (home == "/" ? std::string() : home) + value.substr(homePrefix.size());
    } else if (!value.empty() && value.front() == '/') {
        path = value;
    }
    while (path.size() > 1 && path.back() == '/')
        path.pop_back();
    return path;
}

std::string desktopOfLine(const std::string &line)
{
    const std::size_t equals = line.find('=');
    if (equals == std::string::npos || trimmed(line.substr(0, equals)) != DesktopKey)
        return {};
    return resolved(unquoted(trimmed(line.substr(equals + 1))));
}

} // namespace

std::string userDesktopDirectory()
{
    // A shell that reads the file keeps the last assignment.
    std::string desktop;
    std::istringstream lines(Vel::SmallFile(xdgConfigHome() + "/user-dirs.dirs").bytes());
    for (std::string line; std::getline(lines, line);) {
        const std::string value = desktopOfLine(line);
        if (!value.empty())
            desktop = value;
    }
    if (!desktop.empty())
        return desktop;
    return inHome(Vel::homeDirectory(), "Desktop");
}
