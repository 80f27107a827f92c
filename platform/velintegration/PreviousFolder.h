// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <filesystem>
#include <string>

#include <sys/types.h>

/**
 * The one copy of a folder that stays beside it when it is replaced: "menu.previous" beside "menu".
 *
 * At each instant what is replaced lies in its own place or in that of the copy. The copy before it
 * goes when all is done; where a program was killed earlier, recover() brings it back.
 */
class PreviousFolder
{
public:
    /// Exchanges two paths in one step; 0, or -1 and errno.
    using Exchange = int (*)(const char *first, const char *second);

    /// The copy of \a target, an absolute path to no link.
    PreviousFolder(const std::filesystem::path &target, Exchange exchange);

    const std::filesystem::path &path() const { return m_path; }

    /// Puts \a folder, which lies beside the target, in the place of the target, and that in the place
    /// of the copy. When that fails, all is as it was, and errno tells why.
    bool replaceTarget(const std::filesystem::path &folder) const;

    /// Ends what killed programs began, and brings the copy back that they put away for it.
    void recover() const;

private:
    bool replaceAtOnce(const std::filesystem::path &folder, const std::filesystem::path &kept) const;
    bool replaceInSteps(const std::filesystem::path &folder, const std::filesystem::path &kept) const;
    std::string keptName() const;
    void recover(const std::filesystem::path &kept, ino_t made) const;

    std::filesystem::path m_target;
    std::filesystem::path m_path;
    Exchange m_exchange;
};
