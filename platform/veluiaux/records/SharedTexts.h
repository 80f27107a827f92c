// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "FileText.h"

#include <QByteArray>
#include <QHash>

#include <array>
#include <atomic>
#include <cstddef>
#include <list>
#include <mutex>
#include <optional>

/**
 * The texts of the files read last, so that records of one unchanged file share one.
 *
 * A text is given out while the file has the stamp it was read with, and only files whose
 * stamp was settled then are kept. That begins when a path is read for the second time: most
 * entries of a menu are read once, for the name and the icon of a row. Of the least recently used ones as
 * many are forgotten as it takes to stay within the limit. May be used from any thread.
 */
class SharedTexts
{
public:
    /// Reads a file from disk; none when that failed.
    using Reader = std::optional<FileText> (*)(const QByteArray &path);

    /// The memory that texts and their indexes may take, in bytes.
    static constexpr std::size_t Limit = std::size_t(8) * 1024 * 1024;

    static SharedTexts &instance();

    /// The text of \a path: the one that is known while the file is as it was, or was read ahead,
    /// else what \a read gives. From the second time on it is kept if its stamp is settled.
    std::optional<FileText> findOrRead(const QByteArray &path, Reader read);
    /// The text of \a path if it is known and the file still as it was.
    std::optional<FileText> find(const QByteArray &path);
    void insert(const QByteArray &path, const FileText &file);
    /// Forgets the text of \a path, which was just replaced.
    void remove(const QByteArray &path);

    /// The memory taken now, in bytes.
    std::size_t cost() const;
    void clear();

private:
    struct Item
    {
        QByteArray path;
        FileText file;
        std::size_t cost;
    };
    using Items = std::list<Item>; // the most recently used first

    bool isKnown(const QByteArray &path);
    void forget(Items::iterator item);

    mutable std::mutex m_mutex;
    Items m_items;
    QHash<QByteArray, Items::iterator> m_index;
    std::size_t m_cost = 0;
    std::array<std::atomic<std::size_t>, 4096> m_seen{}; // hashes of paths that were read before
};
