// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <string>

/**
 * By what a change in a folder is noticed.
 *
 * The times of a folder tell that something in it came, went or was replaced, but not that a file
 * in it was written to. Who installs a file often does both, so of a folder that changed in the
 * last two seconds the stamps of the files in it are noted as well, until it is seen to be older.
 */
struct FolderStamp
{
    std::string path;
    std::string times; ///< of the folder, and which one it is; empty where there is none
    std::string contents; ///< a digest of the stamps of what is in it; empty of one that is settled

    /// The stamp of the folder as it is now.
    static FolderStamp of(const std::string &path);
    /// The same by its times alone, however young they are.
    static FolderStamp withoutContents(const std::string &path);

    /// Whether the folder is still as it was then.
    bool isCurrent() const;
    /// Whether the contents need not be noted any more, as long as the times stay.
    bool canSettle() const;

    bool operator==(const FolderStamp &other) const
    {
        return path == other.path && times == other.times && contents == other.contents;
    }
};
