// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ListedMenu.h"

#include "MenuTree.h"

#include <QFileInfo>

#include <algorithm>

namespace {

bool isForStarting(const MenuItem &item)
{
    return item.kind == MenuItem::Entry || item.kind == MenuItem::File;
}

// Whether anything can be started in it, at any depth.
bool hasAny(const MenuItem &folder)
{
    return std::any_of(folder.children.cbegin(), folder.children.cend(), [](const MenuItem &item) {
        return item.kind == MenuItem::Folder ? hasAny(item) : isForStarting(item);
    });
}

} // namespace

MenuItem ListedMenu::of(const MenuItem &menu, const IconFile &iconFile)
{
    MenuItem listed = menu;
    listed.icon = menu.icon.isEmpty() || !iconFile ? QString() : iconFile(menu.icon);
    if (menu.name.isEmpty() && menu.kind == MenuItem::Folder)
        listed.name = QFileInfo(menu.path).fileName();
    listed.children.clear();
    for (const MenuItem &child : menu.children) {
        if (!child.isListed)
            continue;
        const MenuItem item = of(child, iconFile);
        if (item.kind != MenuItem::Folder || hasAny(item))
            listed.children.append(item);
    }
    return listed;
}

void ListedMenu::addIconFiles(MenuItem *menu, const IconFile &iconFile)
{
    const auto fileOf = [&iconFile](const QString &icon) {
        return icon.isEmpty() ? QString() : iconFile(icon);
    };
    menu->iconFile = fileOf(menu->icon);
    for (MenuItemAction &action : menu->details.actions)
        action.iconFile = fileOf(action.icon);
    for (MenuItem &child : menu->children)
        addIconFiles(&child, iconFile);
}
