// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "FolderStamp.h"

#include <map>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

/**
 * What is remembered of a start menu beside it: which entry was made from which application, and
 * what it looked like then. By this an update tells what the user edited, moved or deleted.
 *
 * As a file it is plain text, a fact on each line, the words percent-escaped.
 */
struct MenuSources
{
    /// An entry as it was made.
    struct Version
    {
        std::string place; ///< its folder and its name, with a "/" between; empty for none
        std::string digest; ///< see ContentsDigest.h

        bool operator==(const Version &other) const { return place == other.place && digest == other.digest; }
        bool operator!=(const Version &other) const { return !(*this == other); }
    };

    /// What became of an application. That there is no such file any more means that the user
    /// deleted or moved it, as long as nothing is being changed.
    struct Entry
    {
        Version made;
        /// It is being changed to this, or removed where this is none; written down before that is
        /// begun, so that it can be told later how far a killed program came.
        Version next;
        bool isChanging = false;

        bool operator==(const Entry &other) const
        {
            return made == other.made && next == other.next && isChanging == other.isChanging;
        }
    };

    std::map<std::string, Entry> entries; ///< by the ids of their applications
    std::map<std::string, std::string> folders; ///< the records of folders of ours, without their order
    std::vector<FolderStamp> stamps; ///< where nothing has changed, there is nothing to do
    std::string environment; ///< a digest of the variables on which it depends what is found
    std::string searchPath; ///< the same of PATH; empty when it does not depend on that

    /// The text of the file.
    std::string toText() const;
    /// What a file says; none for anything that toText() did not write.
    static std::optional<MenuSources> fromText(std::string_view text);

    /// Whether \a place is the name of an entry in a folder of the menu.
    static bool isPlace(std::string_view place);
};
