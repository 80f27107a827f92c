// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ApplicationsMenu.h"

#include "FolderCopy.h"
#include "InstalledApplications.h"
#include "MenuCategories.h"

#include <velcore/language.h>
#include <veluiaux/VelUIDesktopEntry.h>

#include <QCollator>
#include <QFile>
#include <QLocale>

#include <algorithm>
#include <cerrno>
#include <fstream>
#include <map>

namespace fs = std::filesystem;

namespace {

// By this much of a name it is ordered: marks in an odd order make a collator take very long.
constexpr int LongestName = 255;

struct MenuItem
{
    std::string id;
    std::string source;
    QString shownName;
    std::string fileName;
};
using MenuItems = std::vector<MenuItem>;

bool isShownApplication(const VelUIDesktopEntry &entry)
{
    return entry.getType() == QLatin1String("Application") && entry.isDisplayable(nullptr);
}

// The applications by the place of their category.
std::map<int, MenuItems> collectItems()
{
    std::map<int, MenuItems> items;
    for (const InstalledApplication &application : installedApplications()) {
        const VelUIDesktopEntry entry(QFile::decodeName(application.path.c_str()));
        if (!isShownApplication(entry))
            continue;
        const QString localName = entry.getLocalName();
        items[menuCategoryOf(entry.getCategories())].push_back(
            {application.id, application.path, localName.isEmpty() ? entry.getName() : localName,
             fs::path(application.path).filename().string()});
    }
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
            if (uses[item.fileName] > 1 && item.fileName != item.id) {
                item.fileName = item.id;
                changed = true;
            }
        }
    }
}

void sortByShownName(MenuItems *items)
{
    QCollator collator(QLocale(QString::fromStdString(velLanguageCode())));
    collator.setCaseSensitivity(Qt::CaseInsensitive);
    std::sort(items->begin(), items->end(), [&collator](const MenuItem &left, const MenuItem &right) {
        const int order =
            collator.compare(left.shownName.left(LongestName), right.shownName.left(LongestName));
        return order != 0 ? order < 0 : left.fileName < right.fileName;
    });
}

bool writeDirectoryEntry(const fs::path &folder, const MenuCategory &category, const QStringList &sortOrder)
{
    const QByteArray entry = menuDirectoryEntry(category, sortOrder);
    std::ofstream file(folder / ".directory", std::ios::binary);
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
        if (!copyFile(item.source, folder / item.fileName))
            return false;
        sortOrder.append(QFile::decodeName(item.fileName.c_str()));
    }
    return writeDirectoryEntry(folder, category, sortOrder);
}

} // namespace

bool buildApplicationsMenu(const fs::path &folder)
{
    std::map<int, MenuItems> itemsOfCategories = collectItems();
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
