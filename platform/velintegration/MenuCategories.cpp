// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuCategories.h"

#include "MenuNames.h"

#include <DesktopEntryValue.h>
#include <RecordFile.h>

#include <algorithm>

const QVector<MenuCategory> &menuCategories()
{
    static const QVector<MenuCategory> categories = {
        {"AudioVideo", "applications-multimedia", "Multimedia"},
        {"Audio", "applications-multimedia", "Audio"},
        {"Video", "applications-multimedia", "Video"},
        {"Development", "applications-development", "Development"},
        {"Education", "applications-education", "Education"},
        {"Game", "applications-games", "Games"},
        {"Graphics", "applications-graphics", "Graphics"},
        {"Network", "applications-internet", "Internet"},
        {"Office", "applications-office", "Office"},
        {"Science", "applications-science", "Science"},
        {"Settings", "preferences-desktop", "Settings"},
        {"System", "applications-system", "System"},
        {"Utility", "applications-utilities", "Utilities"},
        {"Other", "applications-other", "Other"},
    };
    return categories;
}

const MenuCategory &menuRoot()
{
    static const MenuCategory root = {"", "start-here", "Start Menu"};
    return root;
}

int menuCategoryOf(const QStringList &categories)
{
    const QVector<MenuCategory> &all = menuCategories();
    // "Other" is our own folder: an entry that names such a category has no main one.
    const auto end = all.constEnd() - 1;
    for (const QString &category : categories) {
        const auto found = std::find_if(all.constBegin(), end, [&category](const MenuCategory &known) {
            return category == QLatin1String(known.folder);
        });
        if (found != end)
            return static_cast<int>(found - all.constBegin());
    }
    return all.size() - 1;
}

QByteArray menuDirectoryEntry(const MenuCategory &category, const QStringList &sortOrder)
{
    QByteArray entry = "[Desktop Entry]\nType=Directory\nName=" + QByteArray(category.name) + '\n';
    for (const MenuName &name : menuNames(category.name))
        entry += "Name[" + QByteArray(name.language) + "]=" + name.text + '\n';
    entry += "Icon=" + QByteArray(category.icon) + '\n';
    if (!sortOrder.isEmpty())
        entry += "SortOrder=" + QByteArray::fromStdString(DesktopEntryValue::fromList(sortOrder)) + '\n';
    return entry;
}

std::filesystem::path menuFolderRecord(const std::filesystem::path &folder)
{
    return folder / RecordFile;
}
