// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "NewMenu.h"

#include "ApplicationsMenu.h"
#include "CategoryFolder.h"
#include "FolderCopy.h"
#include "FolderRemoval.h"
#include "FolderReplacement.h"
#include "KnownEntries.h"
#include "MenuCategories.h"
#include "ResolvedFolder.h"
#include "SourcesFile.h"

#include <cerrno>

namespace fs = std::filesystem;

namespace {

bool isGiven(const char *templateDir)
{
    return templateDir && *templateDir;
}

bool build(const fs::path &folder, const char *templateDir, const std::vector<MenuApplication> &applications)
{
    return isGiven(templateDir) ? copyFolderContents(templateDir, folder)
                                : buildApplicationsMenu(folder, applications);
}

// Of a template that leaves applications out they are left out later, too.
MenuSources sourcesOf(const fs::path &folder, const std::vector<MenuApplication> &applications)
{
    MenuSources sources;
    const auto found =
        KnownEntries::find(applications, MenuSnapshot::ofAll(folder), KnownEntries::Rest::Deleted);
    for (const auto &[id, version] : found)
        sources.entries[id] = {version, {}, false};
    for (const MenuCategory &category : menuCategories()) {
        const CategoryFolder made(folder, category.folder);
        if (made.exists() && made.digest() == made.newDigest())
            sources.folders[category.folder] = made.newDigest();
    }
    return sources;
}

struct Result
{
    NewMenu::Outcome outcome;
    int error; ///< of the system; 0 for an unknown one
};

Result failed(int error)
{
    return {NewMenu::Outcome::Failed, error};
}

Result make(const fs::path &menu, const char *templateDir, const ApplicationsLook &look, bool isReplacing)
{
    FolderReplacement replacement(menu);
    if (!replacement.isOpen())
        return failed(replacement.error());
    errno = 0;
    if (!build(replacement.folder(), templateDir, look.found.all))
        return failed(errno);

    const fs::path target = resolvedFolder(menu);
    SourcesFile file(target);
    const bool isRemembered = !isReplacing || file.exists();
    if (isRemembered && !file.lock())
        return failed(errno);
    if (!isReplacing && pathExists(target))
        return {NewMenu::Outcome::Found, 0};
    MenuSources sources;
    if (isRemembered)
        sources = sourcesOf(replacement.folder(), look.found.all);
    if (!replacement.commit())
        return failed(replacement.error());
    if (isRemembered) {
        NewMenu::setStamps(target, look, &sources);
        file.write(sources.toText()); // without it the next update knows the entries again
    }
    return {NewMenu::Outcome::Made, 0};
}

// What is removed when it fails must not change errno.
NewMenu::Outcome makeOrTell(const fs::path &menu, const char *templateDir, const ApplicationsLook &look,
                            bool isReplacing)
{
    std::error_code error;
    Result result = failed(0);
    if (isGiven(templateDir) && !fs::is_directory(templateDir, error))
        result = failed(error ? error.value() : ENOTDIR);
    else if (!isReplacing && !isGiven(templateDir) && look.found.all.empty())
        result = failed(ENODATA);
    else
        result = make(menu, templateDir, look, isReplacing);
    errno = result.error;
    return result.outcome;
}

} // namespace

NewMenu::Outcome NewMenu::replace(const fs::path &menu, const char *templateDir, const ApplicationsLook &look)
{
    return makeOrTell(menu, templateDir, look, true);
}

NewMenu::Outcome NewMenu::makeMissing(const fs::path &menu, const char *templateDir,
                                      const ApplicationsLook &look)
{
    return makeOrTell(menu, templateDir, look, false);
}

void NewMenu::setStamps(const fs::path &menu, const ApplicationsLook &look, MenuSources *sources)
{
    sources->environment = look.environment;
    sources->searchPath = look.searchPath;
    sources->stamps = look.stamps;
    if (look.stamps.empty())
        return;
    sources->stamps.push_back(FolderStamp::of(menu.string()));
    for (const MenuCategory &category : menuCategories()) {
        if (CategoryFolder(menu, category.folder).exists())
            sources->stamps.push_back(FolderStamp::of((menu / category.folder).string()));
    }
}
