// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <memory_resource>

/**
 * Memory in whole pages of the system's, for what lives for a moment only.
 *
 * The heap keeps what was returned to it, and the more so if it is one thread that allocates and
 * another one that frees; here every page goes back at once. Meant to stand behind a pool.
 */
class PageMemory : public std::pmr::memory_resource
{
private:
    void *do_allocate(std::size_t bytes, std::size_t alignment) override;
    void do_deallocate(void *place, std::size_t bytes, std::size_t alignment) override;
    bool do_is_equal(const std::pmr::memory_resource &other) const noexcept override;
};
