// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "FileText.h"

#include <cstddef>
#include <memory_resource>

/**
 * A text with its index and its stamp in one block of memory, which comes from elsewhere than the
 * heap. Whoever packs it frees it, with the same memory.
 */
class PackedText
{
public:
    /// Nothing.
    PackedText() = default;
    /// Makes the index of \a file if there is none. Throws std::bad_alloc.
    PackedText(const FileText &file, std::pmr::memory_resource *memory);

    bool isEmpty() const { return m_block == nullptr; }
    /// The size of the block, in bytes.
    std::size_t size() const { return m_size; }
    /// What that of \a file would be.
    static std::size_t sizeOf(const FileText &file);
    /// The same text once more, in the heap; not to be asked of nothing.
    FileText unpacked() const;
    /// Gives the block back to the \a memory that it came from; nothing is left.
    void free(std::pmr::memory_resource *memory);

private:
    struct Head;

    std::byte *m_block = nullptr;
    std::size_t m_size = 0;
};
