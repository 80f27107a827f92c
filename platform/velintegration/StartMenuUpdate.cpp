// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "StartMenuUpdate.h"

#include "ApplicationsLook.h"
#include "CategoryFolder.h"
#include "MenuExecution.h"
#include "MenuPlan.h"
#include "MenuSnapshot.h"
#include "MenuSources.h"
#include "NewMenu.h"
#include "SourcesFile.h"

#include <algorithm>
#include <utility>

namespace fs = std::filesystem;

using VelStartMenu::Look;
using VelStartMenu::Result;

namespace {

bool isCurrent(const MenuSources &sources)
{
    return !sources.stamps.empty() && sources.environment == ApplicationsLook::environmentNow()
        && (sources.searchPath.empty() || sources.searchPath == ApplicationsLook::searchPathNow())
        && std::all_of(sources.stamps.begin(), sources.stamps.end(),
                       [](const FolderStamp &stamp) { return stamp.isCurrent(); });
}

bool canSettle(const MenuSources &sources)
{
    return std::any_of(sources.stamps.begin(), sources.stamps.end(),
                       [](const FolderStamp &stamp) { return stamp.canSettle(); });
}

} // namespace

StartMenuUpdate::StartMenuUpdate(fs::path menu, const char *templateDir)
    : m_menu(std::move(menu))
    , m_templateDir(templateDir)
{
}

Result StartMenuUpdate::run(Look look) const
{
    std::error_code error;
    if (!m_menu.has_filename())
        return Result::Failed;
    if (!fs::is_directory(m_menu, error))
        return make();
    if (look == Look::Folders && isUpToDate())
        return Result::Unchanged;
    return follow();
}

// When everything has been quiet for long enough, the times of the folders tell all from then on.
bool StartMenuUpdate::isUpToDate() const
{
    const SourcesFile file(m_menu);
    const std::optional<MenuSources> sources = MenuSources::fromText(file.read());
    return sources && isCurrent(*sources) && (!canSettle(*sources) || settle());
}

bool StartMenuUpdate::settle() const
{
    SourcesFile file(m_menu);
    if (!file.lock())
        return true;
    std::optional<MenuSources> sources = MenuSources::fromText(file.read());
    if (!sources || !isCurrent(*sources))
        return false;
    for (FolderStamp &stamp : sources->stamps) {
        if (stamp.canSettle())
            stamp.contents.clear();
    }
    file.write(sources->toText());
    return true;
}

Result StartMenuUpdate::make() const
{
    switch (NewMenu::makeMissing(m_menu, m_templateDir, ApplicationsLook::now())) {
    case NewMenu::Outcome::Made:
        return Result::Changed;
    case NewMenu::Outcome::Found:
        return follow();
    case NewMenu::Outcome::Failed:
        break;
    }
    return Result::Failed;
}

Result StartMenuUpdate::follow() const
{
    SourcesFile file(m_menu);
    const ApplicationsLook look = ApplicationsLook::now();
    if (look.found.all.empty() || !file.lock())
        return Result::Failed;
    if (file.isAlone())
        CategoryFolder::removeLeftovers(m_menu);
    const std::string oldText = file.read();
    const std::optional<MenuSources> memory = MenuSources::fromText(oldText);
    const MenuSnapshot menu = memory ? MenuSnapshot::ofCategories(m_menu) : MenuSnapshot::ofAll(m_menu);
    const MenuPlan plan = MenuPlan::of(memory, look.found.all, menu);

    MenuSources sources = memory.value_or(MenuSources());
    sources.stamps.clear();
    MenuExecution execution(m_menu, plan, look.found.all, &sources);
    const auto save = [&file](const MenuSources &begun) { return file.write(begun.toText()); };
    const bool isDone = !execution.isNeeded() || execution.run(save);
    if (isDone)
        NewMenu::setStamps(m_menu, look, &sources);
    const std::string text = sources.toText();
    const bool isRemembered = text == oldText || file.write(text);
    if (!isDone || !isRemembered)
        return Result::Failed;
    return execution.hasChanged() ? Result::Changed : Result::Unchanged;
}
