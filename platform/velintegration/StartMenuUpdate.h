// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <velintegration/startmenufollowing.h>

#include <filesystem>
#include <vector>

class SourcesFile;
struct MenuApplication;
struct MenuPlan;
struct MenuSources;

/**
 * One update of a start menu: looks whether there is anything to do, plans it, has it done, and
 * remembers the outcome.
 */
class StartMenuUpdate
{
public:
    /// @param menu an absolute path to no link
    StartMenuUpdate(std::filesystem::path menu, const char *templateDir);

    VelStartMenu::Result run(VelStartMenu::Look look) const;

private:
    bool isUpToDate() const;
    bool settle() const;
    VelStartMenu::Result make() const;
    VelStartMenu::Result follow() const;
    VelStartMenu::Result end(MenuSources *memory, SourcesFile *file) const;
    VelStartMenu::Result carryOut(const MenuPlan &plan, const std::vector<MenuApplication> &applications,
                                  MenuSources *sources, SourcesFile *file) const;
    static bool remember(const MenuSources &sources, SourcesFile *file);

    std::filesystem::path m_menu;
    const char *m_templateDir;
};
