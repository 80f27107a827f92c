// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "PreviousFolder.h"

#include <filesystem>
#include <string>
#include <vector>

/**
 * A new folder that is built beside another and then takes its place.
 *
 * Missing parents of the target are made; a target that is a link is followed, but none that
 * another user may have planted. Unless commit() succeeds, the target is left as it was and all
 * that was made here is removed; what a killed program made beside the target is removed by the
 * next one that is made an hour later.
 */
class FolderReplacement
{
public:
    using Exchange = PreviousFolder::Exchange;

    explicit FolderReplacement(const std::filesystem::path &target, Exchange exchange = exchangePaths);
    ~FolderReplacement();
    FolderReplacement(const FolderReplacement &) = delete;
    FolderReplacement &operator=(const FolderReplacement &) = delete;

    /// Whether there is a new folder to fill; without one nothing else may be called.
    bool isOpen() const { return !m_folder.empty(); }

    /// Why there is none, or why commit() failed: the number of a system error.
    int error() const { return m_error; }

    /// The new folder, empty at first; its name begins with a dot.
    const std::filesystem::path &folder() const { return m_folder; }

    /// Puts the new folder in the target's place. The old one stays as PreviousFolder, of which
    /// there is one: the one before it goes.
    bool commit();

    /// The exchange of the file system; not every one knows it.
    static int exchangePaths(const char *first, const char *second);

private:
    bool isReplaceable();
    bool makeParents();
    bool makeFolder();
    bool replaceOld();
    void removeLeftovers() const;
    std::string nameFor(const char *purpose) const;
    std::filesystem::path freeName(const char *purpose) const;

    std::filesystem::path m_target;
    std::filesystem::path m_folder;
    std::vector<std::filesystem::path> m_madeParents;
    Exchange m_exchange;
    int m_lock = -1;
    int m_error = 0;
};
