// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "MenuApplications.h"
#include "MenuSnapshot.h"
#include "MenuSources.h"

#include <map>
#include <string>
#include <vector>

/// Which entries of a menu belong to which applications, where nothing about that is remembered.
namespace KnownEntries {

/// What becomes of the applications of which no entry is found.
enum class Rest {
    Missing, ///< nothing is remembered of them, so they are added
    Deleted ///< they are remembered as if the user had deleted their entries
};

/// The entry of \a application where a new menu has it, unchanged; none if there is no such entry.
MenuSources::Version inOwnPlace(const MenuApplication &application, const MenuSnapshot &menu);

/**
 * What is remembered of the applications from now on. No entry is taken for that of two applications.
 *
 * An application whose entry is found elsewhere or with other bytes is remembered as one whose entry
 * was touched, so that nothing is doubled.
 *
 * @param menu everything in it
 */
std::map<std::string, MenuSources::Version> find(const std::vector<MenuApplication> &applications,
                                                 const MenuSnapshot &menu, Rest rest);

} // namespace KnownEntries
