// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "PackedText.h"
#include "PageMemory.h"

#include <atomic>
#include <condition_variable>
#include <cstddef>
#include <list>
#include <memory>
#include <memory_resource>
#include <mutex>
#include <optional>
#include <string>
#include <string_view>
#include <unordered_map>

/**
 * The texts of entries that are about to be asked for, read in a few threads of its own.
 *
 * A text stays until it is taken or its folder is given up. While there is no more room, nothing is
 * read until half of the texts were taken; but where files come from a disk, what comes behind is read all
 * the same, so that the file is in the system's memory by then. Who asks for a text that is not here reads it
 * himself. The threads end when there is nothing to be read, or no room for it; they look at no environment
 * and touch nothing but files and this object. May be used from any thread.
 */
class TextsAhead
{
public:
    /// So many threads read at a time: where files come from a disk, for which threads wait.
    static constexpr int MostThreads = 8;
    /// And where files are in the system's memory.
    static constexpr int MostThreadsInMemory = 3;
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
    /// Whether the text of \a path is here.
    bool isRead(const std::string &path) const;
    /// The text of \a path as it still is on disk, if it was read ahead; it is here no longer. Waits for
    /// nobody: what is being read, or cannot be looked up at once, counts as not here.
    std::optional<FileText> take(const std::string &path);

    /// The memory that texts take now, in bytes.
    std::size_t cost() const;
    /// The threads that there are now.
    int threads() const;
    /// Waits until everything was read that there is room for, and all threads are gone.
    void wait();

private:
    struct File
    {
        Folder *folder;
        PackedText text; // nothing before it was read
    };
    using Files = std::pmr::unordered_map<std::string_view, File>; // by paths in that memory
    using Lock = std::unique_lock<std::mutex>;

    static constexpr std::size_t LargestInPool = 16384; // bytes

    Lock locked() const;
    void startThread();
    void work();
    bool hasRoom() const { return m_cost < Limit / 8 * 7; }
    bool isOnDisk() const { return m_onDisk > 0; }
    int threadsWanted() const { return isOnDisk() ? MostThreads : MostThreadsInMemory; }
    bool hasWork(const Folder &folder) const;
    void noteReading(bool wasOnDisk);
    Ticket nextFolder() const;
    void list(Folder &folder, Lock &lock);
    void readNext(Folder &folder, Lock &lock);
    void readForLater(Folder &folder, Lock &lock);
    void leave(const Ticket &folder);
    void dismiss(const Ticket &folder);
    void goOnWhereRoomIs();
    void add(Folder &folder, std::string_view path);
    void forget(Files::iterator file);
    void freeMemory();

    mutable std::mutex m_mutex;
    std::condition_variable m_progress; // a thread left a folder, or ended
    std::list<Ticket> m_folders; // those with something to be done
    std::list<Ticket> m_full; // those with files that wait for room
    // The threads allocate what others free: in the heap that would leave holes.
    PageMemory m_pages;
    std::pmr::unsynchronized_pool_resource m_memory{{0, LargestInPool}, &m_pages};
    Files m_files{&m_memory};
    std::atomic<std::size_t> m_count{0}; // of the files, to be looked at without the mutex
    std::size_t m_cost = 0;
    int m_threads = 0;
    int m_onDisk = 0; // above zero where files come from a disk
};
