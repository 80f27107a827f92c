// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <filesystem>
#include <string>

/**
 * The file beside a menu in which its MenuSources stand, and with which those who change the menu by
 * themselves keep each other out.
 */
class SourcesFile
{
public:
    /// The file of \a menu, an absolute path to no link.
    explicit SourcesFile(const std::filesystem::path &menu);
    /// Lets others in; a file that was made for the lock alone goes.
    ~SourcesFile();
    SourcesFile(const SourcesFile &) = delete;
    SourcesFile &operator=(const SourcesFile &) = delete;

    /// Whether there is such a file.
    bool exists() const;

    /// What stands in the file; empty when there is none or it cannot be read.
    std::string read() const;

    /**
     * Keeps others out until this object goes; waits for them for some seconds.
     *
     * @return false when they are still there then, or no file can be made
     */
    bool lock();

    /// Whether really nobody else is there: where the file system knows no locks, nobody is kept out.
    bool isAlone() const { return m_isAlone; }

    /// Replaces what stands in the file, whole or not at all. Only with the lock.
    bool write(const std::string &bytes);

private:
    bool openAndLock(bool *isLast);
    bool isStillThere() const;
    int makeReplacement(const std::string &path, const std::string &bytes) const;
    void unlock();

    std::filesystem::path m_path; ///< empty when there can be none
    int m_file = -1;
    bool m_isMade = false;
    bool m_isAlone = false;
};
