// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include <velintegration/startmenu.h>

#include "ApplicationsMenu.h"
#include "FolderCopy.h"
#include "FolderReplacement.h"

namespace fs = std::filesystem;

bool CreateStartMenu(const char *menuDir, const char *templateDir)
{
    if (!menuDir || !*menuDir)
        return false;
    const bool hasTemplate = templateDir && *templateDir;
    std::error_code error;
    if (hasTemplate && !fs::is_directory(templateDir, error))
        return false;

    FolderReplacement replacement(menuDir);
    if (!replacement.isOpen())
        return false;
    const bool built = hasTemplate ? copyFolderContents(templateDir, replacement.folder())
                                   : buildApplicationsMenu(replacement.folder());
    return built && replacement.commit();
}
