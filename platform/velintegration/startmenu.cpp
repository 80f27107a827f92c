// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include <velintegration/startmenu.h>

#include "ApplicationsMenu.h"
#include "FolderCopy.h"
#include "FolderReplacement.h"

#include <cerrno>
#include <filesystem>
#include <system_error>

namespace fs = std::filesystem;

namespace {

constexpr int Unknown = -1;

// 0, or the number of the error; what is removed when it fails must not change that.
int createStartMenu(const char *menuDir, const char *templateDir)
{
    FolderReplacement replacement(menuDir);
    if (!replacement.isOpen())
        return replacement.error();
    errno = 0;
    const bool built = templateDir ? copyFolderContents(templateDir, replacement.folder())
                                   : buildApplicationsMenu(replacement.folder());
    if (!built)
        return errno == 0 ? Unknown : errno;
    return replacement.commit() ? 0 : replacement.error();
}

} // namespace

bool CreateStartMenu(const char *menuDir, const char *templateDir)
{
    const bool hasTemplate = templateDir && *templateDir;
    std::error_code error;
    int reason = 0;
    if (!menuDir || !*menuDir)
        reason = ENOENT;
    else if (hasTemplate && !fs::is_directory(templateDir, error))
        reason = error ? error.value() : ENOTDIR;
    else
        reason = createStartMenu(menuDir, hasTemplate ? templateDir : nullptr);
    errno = reason == Unknown ? 0 : reason;
    return reason == 0;
}
