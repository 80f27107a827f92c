// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FolderWatch.h"

#include <array>
#include <cerrno>
#include <filesystem>

#include <sys/inotify.h>
#include <unistd.h>

namespace fs = std::filesystem;

namespace {

constexpr std::uint32_t Changes = IN_CREATE | IN_DELETE | IN_MOVED_FROM | IN_MOVED_TO | IN_CLOSE_WRITE
    | IN_ATTRIB | IN_DELETE_SELF | IN_MOVE_SELF;

} // namespace

FolderWatch::FolderWatch()
    : m_inotify(inotify_init1(IN_CLOEXEC | IN_NONBLOCK))
{
}

FolderWatch::~FolderWatch()
{
    if (m_inotify >= 0)
        close(m_inotify);
}

bool FolderWatch::setFolders(const std::vector<std::string> &folders)
{
    Watches watches;
    bool isComplete = m_inotify >= 0;
    for (const std::string &folder : folders)
        isComplete = isComplete && add(folder, &watches);
    for (const auto &[watch, interest] : m_watches) {
        if (watches.count(watch) == 0)
            inotify_rm_watch(m_inotify, watch);
    }
    m_watches = watches;
    return isComplete;
}

// A folder that is watched already keeps its watch; another one of its name gets one of its own.
bool FolderWatch::add(const fs::path &folder, Watches *watches) const
{
    std::string missing;
    for (fs::path path = folder;; path = path.parent_path()) {
        const int watch = inotify_add_watch(m_inotify, path.c_str(), Changes | IN_ONLYDIR);
        if (watch >= 0) {
            Interest &interest = (*watches)[watch];
            if (missing.empty())
                interest.isAll = true;
            else
                interest.names.insert(missing);
            return true;
        }
        if ((errno != ENOENT && errno != ENOTDIR && errno != EACCES) || path == path.parent_path())
            return false;
        missing = path.filename().string();
    }
}

// That a watch ended is no news by itself: it was taken away, or something else says so.
bool FolderWatch::isNews(const inotify_event &event) const
{
    if ((event.mask & IN_Q_OVERFLOW) != 0)
        return true;
    const auto watch = m_watches.find(event.wd);
    if (watch == m_watches.end() || (event.mask & IN_IGNORED) != 0)
        return false;
    const Interest &interest = watch->second;
    return interest.isAll || event.len == 0 || interest.names.count(event.name) != 0;
}

bool FolderWatch::takeNews()
{
    alignas(inotify_event) std::array<char, 1 << 14> buffer;
    bool hasNews = false;
    for (ssize_t size = 0; (size = read(m_inotify, buffer.data(), buffer.size())) > 0;) {
        for (ssize_t at = 0; at < size;) {
            const auto *event = reinterpret_cast<const inotify_event *>(buffer.data() + at);
            hasNews = isNews(*event) || hasNews;
            at += ssize_t(sizeof(inotify_event) + event->len);
        }
    }
    return hasNews;
}
