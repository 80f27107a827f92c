// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "CategoryFolder.h"

#include "ContentsDigest.h"
#include "MenuCategories.h"
#include "MenuFile.h"
#include "MenuOrder.h"

#include <cstdio>
#include <vector>

#include <sys/stat.h>

namespace fs = std::filesystem;

namespace {

// The folder that is on its way out; its name follows.
const char GoneName[] = ".velmenu-gone-";

const MenuCategory &categoryNamed(const std::string &name)
{
    for (const MenuCategory &category : menuCategories()) {
        if (name == category.folder)
            return category;
    }
    return menuRoot();
}

bool isFolder(const fs::path &path)
{
    std::error_code error;
    return fs::symlink_status(path, error).type() == fs::file_type::directory;
}

std::vector<fs::path> contentsOf(const fs::path &folder)
{
    std::vector<fs::path> contents;
    std::error_code error;
    for (fs::directory_iterator it(folder, error), end; !error && it != end; it.increment(error))
        contents.push_back(it->path());
    return contents;
}

} // namespace

CategoryFolder::CategoryFolder(const fs::path &menu, const std::string &name)
    : m_menu(menu)
    , m_path(menu / name)
    , m_name(name)
{
}

bool CategoryFolder::exists() const
{
    std::error_code error;
    return fs::is_directory(m_path, error);
}

bool CategoryFolder::make(const QStringList &order) const
{
    const fs::path folder = MenuFile::temporaryIn(m_menu);
    if (mkdir(folder.c_str(), 0777) != 0)
        return false;
    const std::string record = menuDirectoryEntry(categoryNamed(m_name), order).toStdString();
    if (MenuFile::add(menuFolderRecord(folder), {record}) && MenuFile::renameToFree(folder, m_path))
        return true;
    std::error_code error;
    fs::remove_all(folder, error);
    return false;
}

std::string CategoryFolder::digest() const
{
    MenuFile::Contents record;
    const bool isRead = MenuFile::read(menuFolderRecord(m_path), &record);
    return isRead ? contentsDigest(MenuOrder::withoutOrder(record.bytes)) : std::string();
}

std::string CategoryFolder::newDigest() const
{
    return contentsDigest(menuDirectoryEntry(categoryNamed(m_name), {}).toStdString());
}

bool CategoryFolder::hasRecordOnly(const fs::path &folder)
{
    for (const fs::path &path : contentsOf(folder)) {
        if (path != menuFolderRecord(folder))
            return false;
    }
    return true;
}

// Out of the way first: then nobody puts anything into it any more, and what came at the last moment
// brings it back.
bool CategoryFolder::removeIfEmpty(const std::string &digest) const
{
    if (!isFolder(m_path) || digest.empty() || this->digest() != digest || !hasRecordOnly(m_path))
        return false;
    const fs::path gone = m_menu / (GoneName + m_name);
    if (!MenuFile::renameToFree(m_path, gone))
        return false;
    removeLeftover(m_menu, gone);
    return !exists();
}

void CategoryFolder::removeLeftover(const fs::path &menu, const fs::path &leftover)
{
    const std::string name = leftover.filename().string();
    const bool isGone = name.compare(0, sizeof GoneName - 1, GoneName) == 0;
    std::error_code error;
    if (!isFolder(leftover))
        fs::remove(leftover, error);
    else if (hasRecordOnly(leftover) || !isGone)
        fs::remove_all(leftover, error);
    else
        MenuFile::renameToFree(leftover, menu / name.substr(sizeof GoneName - 1));
}

void CategoryFolder::removeLeftovers(const fs::path &menu)
{
    const auto removeIn = [&menu](const fs::path &folder) {
        for (const fs::path &path : contentsOf(folder)) {
            if (MenuFile::isTemporary(path.filename().string()))
                removeLeftover(menu, path);
        }
    };
    removeIn(menu);
    for (const MenuCategory &category : menuCategories()) {
        if (isFolder(menu / category.folder))
            removeIn(menu / category.folder);
    }
}
