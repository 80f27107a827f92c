// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <filesystem>
#include <string>
#include <string_view>
#include <system_error>

class FileProgress;

/**
 * A hidden folder of ours in the target directory, in which a copy is made ready. The lock on it
 * tells that it is in use, however long the copying takes.
 */
class StagingFolder
{
public:
    /// Makes one in \a directory; \a progress follows its removal.
    StagingFolder(const std::filesystem::path &directory, FileProgress &progress);
    /// Removes it with what is in it.
    ~StagingFolder();
    StagingFolder(const StagingFolder &) = delete;
    StagingFolder &operator=(const StagingFolder &) = delete;

    /// Why there is none.
    std::error_code error() const { return m_error; }
    /// The path in it of that number.
    std::filesystem::path item(int number = 0) const { return m_path / ("item" + std::to_string(number)); }

    /// Whether a file or folder called \a name may be one of ours.
    static bool isNameOfOne(std::string_view name);

    /// Removes from \a directory what copies left there when they were killed: folders of this
    /// user's that nobody uses and nobody has touched for an hour.
    static void removeLeftovers(const std::filesystem::path &directory);

private:
    FileProgress &m_progress;
    std::filesystem::path m_path;
    int m_folder = -1;
    std::error_code m_error;
};
