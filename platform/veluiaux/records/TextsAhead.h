// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "FileText.h"

#include <atomic>
#include <condition_variable>
#include <cstddef>
#include <list>
#include <memory>
#include <mutex>
#include <optional>
#include <string>
#include <unordered_map>
#include <vector>

/**
 * The texts of entries that are about to be asked for, read in a few threads of its own.
 *
 * A text stays until it is taken, its folder is given up or there is no more room; what comes
 * behind that is read all the same, so that the file is in the system's memory by then. Who asks
 * for a text that is not here reads it himself. The threads end when there is nothing to be read;
 * they look at no environment and touch nothing but files and this object. May be used from any
 * thread.
 */
class TextsAhead
{
public:
    /// So many threads read at a time.
    static constexpr int MostThreads = 3;
    /// The memory that texts may take until they are taken, in bytes.
    static constexpr std::size_t Limit = std::size_t(6) * 1024 * 1024;
    /// So many files of a folder are read ahead.
    static constexpr std::size_t MostFiles = 100000;

    /// A folder that is being read.
    class Folder;
    using Ticket = std::shared_ptr<Folder>;

    static TextsAhead &instance();

    /// Has the entries and the record file of \a folder read, and the record files of its folders.
    Ticket read(std::string folder);
    /// Whether no file is known that take() could give: nothing is being read ahead. Waits for nobody.
    bool isEmpty() const { return m_count.load(std::memory_order_acquire) == 0; }
    /// Gives up what of the folder was not taken. Nothing of it is being read any more afterwards.
    void giveUp(const Ticket &folder);
    /// The text of \a path as it still is on disk, if it was read ahead; it is here no longer. Waits
    /// for a file that is being read.
    std::optional<FileText> take(const std::string &path);

    /// The memory that texts take now, in bytes.
    std::size_t cost() const;
    /// The threads that there are now.
    int threads() const;
    /// Waits until everything was read, and all threads are gone.
    void wait();

private:
    enum class State { Waiting, Reading, Read };
    struct File
    {
        Folder *folder;
        State state;
        std::optional<FileText> text; // none of what could not be read, and where there was no room
        std::size_t cost;
    };
    using Lock = std::unique_lock<std::mutex>;

    void startThread();
    void work();
    Ticket nextFolder() const;
    void list(Folder &folder, Lock &lock);
    void readNext(Folder &folder, Lock &lock);
    void forget(const std::string &path);
    void erase(std::unordered_map<std::string, File>::iterator file);

    mutable std::mutex m_mutex;
    std::condition_variable m_progress; // a file was read or listed, or a thread ended
    std::list<Ticket> m_folders; // those with files that wait
    std::unordered_map<std::string, File> m_files;
    std::atomic<std::size_t> m_count{0}; // of the files, to be looked at without the mutex
    std::size_t m_cost = 0;
    int m_threads = 0;
};
