// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "FileCopy.h"

#include <filesystem>
#include <map>
#include <memory>
#include <system_error>
#include <vector>

class FileProgress;
class StagingFolder;

/**
 * Copies of files and folders that are made ready out of sight and then appear together, or not
 * at all. Whoever watches the folder sees it change once.
 */
class StagedCopies
{
public:
    using Path = std::filesystem::path;

    /// Where \a kind is a move, the sources go when the copies appear.
    StagedCopies(FileCopy::Kind kind, FileProgress &progress);
    /// Removes what has not appeared.
    ~StagedCopies();
    StagedCopies(const StagedCopies &) = delete;
    StagedCopies &operator=(const StagedCopies &) = delete;

    /// Copies \a source with everything in it, to become \a target.
    std::error_code add(const Path &source, const Path &target);

    /**
     * Has all copies appear. A source that is moved leaves its place in one step after that: at
     * each instant both are there or only the copy. When one of them fails, all is as it was.
     */
    std::error_code reveal();
    /// The source that reveal() failed for.
    const Path &failed() const { return m_failed; }

private:
    struct Item
    {
        Path source;
        Path target;
        Path staged; // the copy
        Path leaving; // where a source that is moved goes
    };

    std::error_code findPlace(const Path &directory, Path *place);
    std::error_code copy(const Path &source, const Path &target);
    std::error_code revealOne(const Item &item) const;
    void hide(const Item &item) const;

    const FileCopy::Kind m_kind;
    FileProgress &m_progress;
    std::map<Path, std::unique_ptr<StagingFolder>> m_folders; // by what they lie in
    std::vector<Item> m_items;
    int m_places = 0;
    Path m_failed;
};
