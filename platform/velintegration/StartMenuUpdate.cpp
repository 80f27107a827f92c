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
#include <cerrno>
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

// All at once, so that it is written down once.
bool canSettle(const MenuSources &sources)
{
    const auto isSettled = [](const FolderStamp &stamp) { return stamp.contents.empty(); };
    return !std::all_of(sources.stamps.begin(), sources.stamps.end(), isSettled)
        && std::all_of(sources.stamps.begin(), sources.stamps.end(),
                       [&](const FolderStamp &stamp) { return isSettled(stamp) || stamp.canSettle(); });
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
    if (!canSettle(*sources))
        return true;
    for (FolderStamp &stamp : sources->stamps)
        stamp.contents.clear();
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
    errno = look.found.all.empty() ? ENODATA : 0;
    if (look.found.all.empty() || !file.lock())
        return Result::Failed;
    if (file.isAlone())
        CategoryFolder::removeLeftovers(m_menu);
    std::optional<MenuSources> memory = MenuSources::fromText(file.read());
    const Result ended = memory ? end(&*memory, &file) : Result::Unchanged;
    if (ended == Result::Failed)
        return ended;

    const MenuSnapshot menu = memory ? MenuSnapshot::ofCategories(m_menu) : MenuSnapshot::ofAll(m_menu);
    MenuSources sources = memory.value_or(MenuSources());
    sources.stamps.clear();
    const Result result =
        carryOut(MenuPlan::of(memory, look.found.all, menu), look.found.all, &sources, &file);
    const int reason = errno;
    if (result != Result::Failed)
        NewMenu::setStamps(m_menu, look, &sources);
    if (!remember(sources, &file))
        return Result::Failed;
    errno = reason;
    return result == Result::Unchanged ? ended : result;
}

Result StartMenuUpdate::end(MenuSources *memory, SourcesFile *file) const
{
    const MenuPlan plan = MenuPlan::ending(*memory, MenuSnapshot::ofCategories(m_menu));
    if (plan.begun.empty())
        return Result::Unchanged;
    const Result result = carryOut(plan, {}, memory, file);
    return result != Result::Failed && remember(*memory, file) ? result : Result::Failed;
}

Result StartMenuUpdate::carryOut(const MenuPlan &plan, const std::vector<MenuApplication> &applications,
                                 MenuSources *sources, SourcesFile *file) const
{
    MenuExecution execution(m_menu, plan, applications, sources);
    const auto save = [file](const MenuSources &begun) { return remember(begun, file); };
    if (execution.isNeeded() && !execution.run(save))
        return Result::Failed;
    return execution.hasChanged() ? Result::Changed : Result::Unchanged;
}

bool StartMenuUpdate::remember(const MenuSources &sources, SourcesFile *file)
{
    const std::string text = sources.toText();
    const bool isThere = text == file->read();
    errno = 0;
    return isThere || file->write(text);
}
