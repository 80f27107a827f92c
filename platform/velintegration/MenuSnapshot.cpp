// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuSnapshot.h"

#include "ContentsDigest.h"
#include "FolderLimits.h"
#include "MenuCategories.h"

#include <veluiaux/VelUIDesktopEntry.h>

#include <QFile>

namespace fs = std::filesystem;

namespace {

bool isEntry(const std::string &name)
{
    const std::string suffix = ".desktop";
    return name.size() > suffix.size()
        && name.compare(name.size() - suffix.size(), suffix.size(), suffix) == 0;
}

// Links to folders are the user's, who may have put anything behind them: they are not walked.
class Reading
{
public:
    Reading(const fs::path &menu, MenuSnapshot *snapshot)
        : m_menu(menu)
        , m_snapshot(snapshot)
    {
    }

    void readCategories()
    {
        std::error_code error;
        for (fs::directory_iterator it(m_menu, error), end; !error && it != end; it.increment(error))
            m_snapshot->isEmpty = m_snapshot->isEmpty && it->path().filename().string().front() == '.';
        for (const MenuCategory &category : menuCategories()) {
            const fs::path folder = m_menu / category.folder;
            if (!fs::is_directory(folder, error))
                continue;
            m_snapshot->folders.insert(category.folder);
            for (fs::directory_iterator it(folder, error), end; !error && it != end; it.increment(error)) {
                const std::string name = category.folder + ('/' + it->path().filename().string());
                m_snapshot->names.insert(name);
                if (isEntry(name))
                    m_snapshot->files[name].digest = fileDigest(it->path());
            }
        }
    }

    void readAll(const fs::path &folder, std::size_t levels)
    {
        std::error_code error;
        for (fs::directory_iterator it(folder, error), end; !error && it != end; it.increment(error)) {
            if (!m_limits.take(levels, "start menu"))
                return;
            if (it->symlink_status(error).type() == fs::file_type::directory)
                readAll(it->path(), levels + 1);
            else if (isEntry(it->path().filename().string()))
                read(it->path());
        }
    }

private:
    void read(const fs::path &path)
    {
        const VelUIDesktopEntry entry(QFile::decodeName(path.c_str()));
        m_snapshot->files[path.lexically_relative(m_menu).string()] = {fileDigest(path), entry.getName(),
                                                                       entry.getExec()};
    }

    fs::path m_menu;
    MenuSnapshot *m_snapshot;
    FolderLimits m_limits;
};

} // namespace

MenuSnapshot MenuSnapshot::ofCategories(const fs::path &menu)
{
    MenuSnapshot snapshot;
    Reading(menu, &snapshot).readCategories();
    return snapshot;
}

MenuSnapshot MenuSnapshot::ofAll(const fs::path &menu)
{
    MenuSnapshot snapshot;
    Reading reading(menu, &snapshot);
    reading.readCategories();
    reading.readAll(menu, 1);
    return snapshot;
}
