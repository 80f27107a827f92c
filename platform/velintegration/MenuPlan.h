// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "MenuApplications.h"
#include "MenuSnapshot.h"
#include "MenuSources.h"

#include <map>
#include <optional>
#include <set>
#include <string>
#include <vector>

/// One change of one entry: it is made, replaced, moved (and replaced with that) or removed.
struct MenuStep
{
    std::string id; ///< of its application
    MenuSources::Version from; ///< none when it is made
    MenuSources::Version to; ///< none when it is removed
    std::string source; ///< the path of the application's entry
};

/**
 * What has to be done so that a menu follows the applications that are installed. Looks at no file
 * and changes none.
 *
 * An entry is touched when it is not in its place any more or any byte of it is another. What is
 * touched is left alone, and what is not there any more does not come back; all else is as the
 * application has it.
 */
struct MenuPlan
{
    /// What is remembered when none of the steps is done.
    std::map<std::string, MenuSources::Version> remembered;
    std::vector<MenuStep> steps;
    /// The other members are about what a killed update began. Untouched entries that it had moved, but
    /// not removed yet where they were.
    std::vector<MenuSources::Version> leftovers;
    /// The places that have to stand in the order of their folders, or may not any more.
    std::set<std::string> placed;
    std::set<std::string> vacated;
    /// The folders in which it was at work, and those of them that may be new.
    std::set<std::string> begun;
    std::set<std::string> made;

    /// What is left to do of what a killed update began; this comes before the rest, which finds
    /// nothing half-done then.
    static MenuPlan ending(const MenuSources &memory, const MenuSnapshot &menu);

    /**
     * @param memory what was remembered, with nothing begun; none when nothing is. Then entries are known by
     * their contents and names, and to a menu without a folder of a main category, which was not made of the
     *        applications, only what comes later is added
     * @param menu everything in it when nothing is remembered, else its folders of main categories
     */
    static MenuPlan of(const std::optional<MenuSources> &memory,
                       const std::vector<MenuApplication> &applications, const MenuSnapshot &menu);
};
