// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include <velintegration/startmenu.h>

#include <velintegration/startmenufollowing.h>

#include "ApplicationsLook.h"
#include "InstalledApplications.h"
#include "NewMenu.h"
#include "ResolvedFolder.h"
#include "StartMenuUpdate.h"

#include <cerrno>

bool CreateStartMenu(const char *menuDir, const char *templateDir)
{
    errno = ENOENT;
    return menuDir && *menuDir
        && NewMenu::replace(menuDir, templateDir, ApplicationsLook::now()) == NewMenu::Outcome::Made;
}

bool UpdateStartMenu(const char *menuDir, const char *templateDir)
{
    return VelStartMenu::update(menuDir, templateDir, VelStartMenu::Look::Folders)
        != VelStartMenu::Result::Failed;
}

VelStartMenu::Result VelStartMenu::update(const char *menuDir, const char *templateDir, Look look)
{
    if (!menuDir || !*menuDir)
        return Result::Failed;
    return StartMenuUpdate(resolvedFolder(menuDir), templateDir).run(look);
}

std::vector<std::string> VelStartMenu::followedFolders()
{
    std::vector<std::string> folders;
    installedApplications([&folders](const std::string &folder) { folders.push_back(folder); });
    return folders;
}
