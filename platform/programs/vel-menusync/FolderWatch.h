// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <filesystem>
#include <map>
#include <set>
#include <string>
#include <vector>

struct inotify_event;

/**
 * Tells when anything changes in some folders: when a file comes, goes or has been written to. Of a
 * folder that does not exist the nearest one above it is watched, in which it may come.
 */
class FolderWatch
{
public:
    FolderWatch();
    ~FolderWatch();
    FolderWatch(const FolderWatch &) = delete;
    FolderWatch &operator=(const FolderWatch &) = delete;

    /// Can be read when there is news; -1 when nothing can be watched.
    int descriptor() const { return m_inotify; }

    /// Watches these folders and no others; false when one of them could not be.
    bool setFolders(const std::vector<std::string> &folders);

    /// Takes what has come; whether it says that anything changed.
    bool takeNews();

private:
    // What is of interest in a folder: the names of its children, or everything.
    struct Interest
    {
        bool isAll = false;
        std::set<std::string> names;
    };
    using Watches = std::map<int, Interest>;

    bool add(const std::filesystem::path &folder, Watches *watches) const;
    bool isNews(const inotify_event &event) const;

    int m_inotify;
    Watches m_watches;
};
