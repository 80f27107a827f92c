// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "MenuPlan.h"
#include "MenuSources.h"

#include <filesystem>
#include <functional>
#include <map>
#include <set>
#include <string>

/**
 * Carries a MenuPlan out. What is to be done is written down before it is begun, so that a killed
 * update is ended by the next one. What was touched since the plan was made is left alone.
 */
class MenuExecution
{
public:
    /// Writes down what is remembered; false when it could not.
    using Save = std::function<bool(const MenuSources &)>;

    /// @param sources what was remembered; has what is to be remembered when all is done
    MenuExecution(const std::filesystem::path &menu, const MenuPlan &plan,
                  const std::vector<MenuApplication> &applications, MenuSources *sources);

    /// Whether there is anything to do.
    bool isNeeded() const;
    /// Does it; false when something could not be done, why is in errno then, or 0.
    bool run(const Save &save);
    /// Whether the menu is another one now.
    bool hasChanged() const { return m_hasChanged; }

private:
    struct Children
    {
        std::set<std::string> gone;
        std::set<std::string> come;
    };

    void adoptFolders();
    void makeFolders();
    void makeFolder(const std::string &name);
    bool carryOut(const MenuStep &step);
    bool change(const MenuStep &step) const;
    void noteDone(const MenuStep &step);
    void removeLeftovers();
    void updateOrders();
    void removeFolders();
    void updateRootOrder();
    bool noted(bool isDone);

    std::filesystem::path m_menu;
    const MenuPlan &m_plan;
    MenuSources *m_sources;
    std::map<std::string, const MenuApplication *> m_applications; // by id
    std::map<std::string, Children> m_children; // by folder
    Children m_folders;
    bool m_isDone = true;
    int m_reason = 0; // why not
    bool m_hasChanged = false;
};
