// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ApplicationsMenu.h"

#include "FolderCopy.h"
#include "MenuApplications.h"
#include "MenuCategories.h"
#include "ShownNameOrder.h"

#include <QFile>

#include <algorithm>
#include <cerrno>
#include <fstream>
#include <map>

namespace fs = std::filesystem;

namespace {

struct MenuItem
{
    const MenuApplication *application;
    std::string fileName;
};
using MenuItems = std::vector<MenuItem>;

// The applications by the place of their category.
std::map<int, MenuItems> collectItems(const std::vector<MenuApplication> &applications)
{
    std::map<int, MenuItems> items;
    for (const MenuApplication &application : applications)
        items[application.category].push_back({&application, application.fileName});
    return items;
}

// Items whose names clash get their ids, which are different. An id may clash with the name of
// another item in turn, so this goes on until nothing does.
void resolveClashes(MenuItems *items)
{
    for (bool changed = true; changed;) {
        changed = false;
        std::map<std::string, int> uses;
        for (const MenuItem &item : *items)
            ++uses[item.fileName];
        for (MenuItem &item : *items) {
            if (uses[item.fileName] > 1 && item.fileName != item.application->id) {
                item.fileName = item.application->id;
                changed = true;
            }
        }
    }
}

void sortByShownName(MenuItems *items)
{
    const ShownNameOrder order;
    std::sort(items->begin(), items->end(), [&order](const MenuItem &left, const MenuItem &right) {
        return order.isBefore(left.application->shownName, left.fileName, right.application->shownName,
                              right.fileName);
    });
}

bool writeDirectoryEntry(const fs::path &folder, const MenuCategory &category, const QStringList &sortOrder)
{
    const QByteArray entry = menuDirectoryEntry(category, sortOrder);
    std::ofstream file(menuFolderRecord(folder), std::ios::binary);
    file.write(entry.constData(), entry.size());
    file.close();
    return !file.fail();
}

bool writeCategory(const fs::path &folder, const MenuCategory &category, const MenuItems &items)
{
    std::error_code error;
    if (!fs::create_directory(folder, error)) {
        errno = error ? error.value() : EEXIST;
        return false;
    }
    QStringList sortOrder;
    for (const MenuItem &item : items) {
        if (!copyFile(item.application->path, folder / item.fileName))
            return false;
        sortOrder.append(QFile::decodeName(item.fileName.c_str()));
    }
    return writeDirectoryEntry(folder, category, sortOrder);
}

} // namespace

bool buildApplicationsMenu(const fs::path &folder, const std::vector<MenuApplication> &applications)
{
    std::map<int, MenuItems> itemsOfCategories = collectItems(applications);
    if (itemsOfCategories.empty()) {
        errno = ENODATA;
        return false;
    }
    QStringList sortOrder;
    for (auto &[place, items] : itemsOfCategories) {
        const MenuCategory &category = menuCategories().at(place);
        resolveClashes(&items);
        sortByShownName(&items);
        if (!writeCategory(folder / category.folder, category, items))
            return false;
        sortOrder.append(QString::fromLatin1(category.folder));
    }
    return writeDirectoryEntry(folder, menuRoot(), sortOrder);
}
