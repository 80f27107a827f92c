// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FolderCopy.h"

#include <algorithm>
#include <system_error>
#include <vector>

namespace fs = std::filesystem;

namespace {

class FolderCopy
{
public:
    explicit FolderCopy(const fs::path &target)
    {
        std::error_code error;
        m_open.push_back(fs::canonical(target, error));
    }

    bool copy(const fs::path &from, const fs::path &to)
    {
        std::error_code error;
        const fs::path real = fs::canonical(from, error);
        if (error)
            return false;
        m_open.push_back(real);
        const bool done = copyEach(from, to);
        m_open.pop_back();
        return done;
    }

private:
    bool copyEach(const fs::path &from, const fs::path &to)
    {
        std::error_code error;
        fs::directory_iterator it(from, error);
        for (; !error && it != fs::directory_iterator(); it.increment(error)) {
            if (!copyOne(it->path(), to / it->path().filename()))
                return false;
        }
        return !error;
    }

    bool copyOne(const fs::path &from, const fs::path &to)
    {
        std::error_code error;
        const fs::file_status status = fs::status(from, error);
        if (fs::is_regular_file(status))
            return copyFile(from, to);
        if (!fs::is_directory(status) || isOpen(from))
            return true;
        return fs::create_directory(to, error) && copy(from, to);
    }

    bool isOpen(const fs::path &folder) const
    {
        std::error_code error;
        return std::find(m_open.begin(), m_open.end(), fs::canonical(folder, error)) != m_open.end();
    }

    std::vector<fs::path> m_open; // the target, and the folders that are being copied
};

} // namespace

bool copyFile(const fs::path &from, const fs::path &to)
{
    std::error_code error;
    if (!fs::copy_file(from, to, error))
        return false;
    fs::permissions(to, fs::perms::owner_read | fs::perms::owner_write, fs::perm_options::add, error);
    return !error;
}

bool copyFolderContents(const fs::path &from, const fs::path &to)
{
    return FolderCopy(to).copy(from, to);
}
