// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "InstalledApplications.h"

#include "FolderLimits.h"

#include <velcore/home.h>

#include <algorithm>
#include <cstdlib>
#include <filesystem>
#include <set>
#include <sstream>
#include <system_error>

namespace {

namespace fs = std::filesystem;

std::string variable(const char *name, const std::string &otherwise)
{
    const char *value = std::getenv(name);
    return value && *value ? std::string(value) : otherwise;
}

std::vector<fs::path> dataDirectories()
{
    std::vector<fs::path> directories;
    directories.emplace_back(Vel::dataHome());
    // The standard has paths ignored that are not absolute.
    std::istringstream list(variable("XDG_DATA_DIRS", "/usr/local/share:/usr/share"));
    for (std::string path; std::getline(list, path, ':');) {
        if (fs::path(path).is_absolute())
            directories.emplace_back(path);
    }
    return directories;
}

bool isDesktopFileName(const std::string &name)
{
    const std::string suffix = ".desktop";
    return name.size() > suffix.size()
        && name.compare(name.size() - suffix.size(), suffix.size(), suffix) == 0;
}

// Walks one "applications" folder and what lies below, links to folders included.
class Walk
{
public:
    Walk(std::set<std::string> *seenIds, std::vector<InstalledApplication> *found,
         const std::function<void(const std::string &)> &onFolder)
        : m_seenIds(seenIds)
        , m_found(found)
        , m_onFolder(onFolder)
    {
    }

    void enter(const fs::path &folder, const std::string &idPrefix)
    {
        // A link may lead back to a folder that is being walked.
        std::error_code error;
        const fs::path real = fs::canonical(folder, error);
        if (std::find(m_open.begin(), m_open.end(), real) != m_open.end())
            return;
        if (m_onFolder)
            m_onFolder(folder.string());
        if (error)
            return;
        m_open.push_back(real);
        for (const fs::path &path : sortedContents(folder)) {
            if (m_limits.take(m_open.size(), "folder of installed applications"))
                visit(path, idPrefix + path.filename().string());
        }
        m_open.pop_back();
    }

private:
    static std::vector<fs::path> sortedContents(const fs::path &folder)
    {
        std::vector<fs::path> paths;
        std::error_code error;
        for (fs::directory_iterator it(folder, error), end; !error && it != end; it.increment(error)) {
            if (it->path().filename().string().front() != '.')
                paths.push_back(it->path());
        }
        std::sort(paths.begin(), paths.end());
        return paths;
    }

    void visit(const fs::path &path, const std::string &id)
    {
        std::error_code error;
        const fs::file_status status = fs::status(path, error);
        if (fs::is_directory(status)) {
            enter(path, id + "-");
            return;
        }
        // A link to /dev/null is a customary way to hide an application, so it counts as seen.
        const bool isFirst = isDesktopFileName(id) && m_seenIds->insert(id).second;
        if (isFirst && fs::is_regular_file(status))
            m_found->push_back({id, path.string()});
    }

    std::set<std::string> *m_seenIds;
    std::vector<InstalledApplication> *m_found;
    const std::function<void(const std::string &)> &m_onFolder;
    std::vector<fs::path> m_open;
    FolderLimits m_limits;
};

} // namespace

std::vector<std::string> applicationFolders()
{
    std::vector<std::string> folders;
    for (const fs::path &directory : dataDirectories())
        folders.push_back((directory / "applications").string());
    return folders;
}

std::vector<InstalledApplication> installedApplications(
    const std::function<void(const std::string &)> &onFolder)
{
    std::set<std::string> seenIds;
    std::vector<InstalledApplication> found;
    for (const std::string &folder : applicationFolders())
        Walk(&seenIds, &found, onFolder).enter(folder, std::string());
    return found;
}
