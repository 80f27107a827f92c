// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ApplicationsLook.h"

#include "ContentsDigest.h"
#include "InstalledApplications.h"

#include <cstdlib>

namespace {

std::string variable(const char *name)
{
    const char *value = std::getenv(name);
    return value ? value : "";
}

} // namespace

std::string ApplicationsLook::environmentNow()
{
    std::string text;
    for (const std::string &folder : applicationFolders())
        text += folder + '\n';
    return contentsDigest(text + '\n' + variable("XDG_CURRENT_DESKTOP"));
}

std::string ApplicationsLook::searchPathNow()
{
    return contentsDigest(variable("PATH"));
}

ApplicationsLook ApplicationsLook::now()
{
    ApplicationsLook look;
    look.found = findMenuApplications();
    look.stamps = look.found.stamps;
    for (const std::string &folder : look.found.programFolders)
        look.stamps.push_back(FolderStamp::withoutContents(folder));
    look.environment = environmentNow();
    look.searchPath = look.found.usesSearchPath ? searchPathNow() : std::string();
    return look;
}
