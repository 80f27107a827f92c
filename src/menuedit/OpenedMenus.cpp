// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "OpenedMenus.h"

#include <QDir>
#include <QFileInfo>
#include <QSettings>
#include <QVector>

#include <algorithm>

namespace {

struct Menu
{
    QString directory;
    QStringList folders;
};

QString arrayName()
{
    return QStringLiteral("VelMenuDialog/Menus");
}

QString directoryKey()
{
    return QStringLiteral("Directory");
}

QString foldersKey()
{
    return QStringLiteral("Opened");
}

QString normalized(const QString &directory)
{
    return QDir::cleanPath(QFileInfo(directory).absoluteFilePath());
}

QVector<Menu> read(QSettings &settings)
{
    QVector<Menu> menus;
    const int count = std::min(settings.beginReadArray(arrayName()), OpenedMenus::MostMenus);
    for (int i = 0; i < count; ++i) {
        settings.setArrayIndex(i);
        menus.append(
            {settings.value(directoryKey()).toString(), settings.value(foldersKey()).toStringList()});
    }
    settings.endArray();
    return menus;
}

void write(QSettings &settings, const QVector<Menu> &menus)
{
    settings.remove(arrayName());
    settings.beginWriteArray(arrayName(), menus.size());
    for (int i = 0; i < menus.size(); ++i) {
        settings.setArrayIndex(i);
        settings.setValue(directoryKey(), menus.at(i).directory);
        settings.setValue(foldersKey(), menus.at(i).folders);
    }
    settings.endArray();
}

} // namespace

QStringList OpenedMenus::foldersOf(const QString &directory)
{
    QSettings settings;
    const QString wanted = normalized(directory);
    for (const Menu &menu : read(settings)) {
        if (menu.directory == wanted)
            return menu.folders;
    }
    return {};
}

void OpenedMenus::keep(const QString &directory, const QStringList &folders)
{
    if (foldersOf(directory) == folders)
        return;
    QSettings settings;
    const QString wanted = normalized(directory);
    QVector<Menu> menus = read(settings);
    menus.erase(std::remove_if(menus.begin(), menus.end(),
                               [&](const Menu &menu) { return menu.directory == wanted; }),
                menus.end());
    if (!folders.isEmpty())
        menus.prepend({wanted, folders});
    menus.resize(std::min(int(menus.size()), MostMenus));
    write(settings, menus);
}
