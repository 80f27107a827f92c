// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuApplications.h"

#include "ContentsDigest.h"
#include "InstalledApplications.h"
#include "MenuCategories.h"

#include <velcore/files.h>
#include <veluiaux/VelUIDesktopEntry.h>

#include <QFile>

#include <cstdlib>
#include <filesystem>
#include <set>
#include <sstream>

namespace fs = std::filesystem;

namespace {

bool isShownApplication(const VelUIDesktopEntry &entry)
{
    return entry.getType() == QLatin1String("Application") && entry.isDisplayable(nullptr);
}

// Where it shows that a program came or went on which it depends whether an entry is displayable.
class ProgramFolders
{
public:
    void note(const VelUIDesktopEntry &entry)
    {
        const std::string program = QFile::encodeName(entry.getTryExec()).toStdString();
        if (program.find('/') != std::string::npos)
            m_folders.insert(fs::path(program).parent_path().string());
        else
            m_usesSearchPath = m_usesSearchPath || !program.empty();
    }

    bool usesSearchPath() const { return m_usesSearchPath; }
    std::vector<std::string> all() const
    {
        std::set<std::string> folders = m_folders;
        const char *path = m_usesSearchPath ? std::getenv("PATH") : nullptr;
        std::istringstream list(path ? path : "");
        for (std::string folder; std::getline(list, folder, ':');)
            folders.insert(folder);
        for (auto it = folders.begin(); it != folders.end();)
            it = fs::path(*it).is_absolute() ? std::next(it) : folders.erase(it);
        return {folders.begin(), folders.end()};
    }

private:
    std::set<std::string> m_folders;
    bool m_usesSearchPath = false;
};

MenuApplication applicationOf(const InstalledApplication &installed, const VelUIDesktopEntry &entry)
{
    MenuApplication application;
    application.id = installed.id;
    application.path = installed.path;
    application.fileName = fs::path(installed.path).filename().string();
    application.category = menuCategoryOf(entry.getCategories());
    application.shownName = shownNameOf(entry);
    application.name = entry.getName();
    application.exec = entry.getExec();
    application.digest = contentsDigest(Vel::SmallFile(installed.path).bytes());
    return application;
}

} // namespace

QString shownNameOf(const VelUIDesktopEntry &entry)
{
    const QString localName = entry.getLocalName();
    return localName.isEmpty() ? entry.getName() : localName;
}

MenuApplications findMenuApplications()
{
    MenuApplications found;
    ProgramFolders programs;
    const auto note = [&found](const std::string &folder) {
        found.stamps.push_back(FolderStamp::of(folder));
    };
    for (const InstalledApplication &installed : installedApplications(note)) {
        const VelUIDesktopEntry entry(QFile::decodeName(installed.path.c_str()));
        programs.note(entry);
        if (isShownApplication(entry))
            found.all.push_back(applicationOf(installed, entry));
    }
    found.programFolders = programs.all();
    found.usesSearchPath = programs.usesSearchPath();
    return found;
}
