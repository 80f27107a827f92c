// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "PageMemory.h"

#include <sys/mman.h>

#include <new>

// What the system maps is aligned to a page, which is more than anybody asks for.
void *PageMemory::do_allocate(std::size_t bytes, std::size_t)
{
    void *const place = ::mmap(nullptr, bytes, PROT_READ | PROT_WRITE, MAP_PRIVATE | MAP_ANONYMOUS, -1, 0);
    if (place == MAP_FAILED)
        throw std::bad_alloc();
    return place;
}

void PageMemory::do_deallocate(void *place, std::size_t bytes, std::size_t)
{
    ::munmap(place, bytes);
}

bool PageMemory::do_is_equal(const std::pmr::memory_resource &other) const noexcept
{
    return this == &other;
}
