// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "IconFiles.h"

#include <veluiaux/VelIconTheme.h>

#include <QDir>
#include <QFileInfo>
#include <QIcon>
#include <QSettings>
#include <QStandardPaths>

namespace {

// The value of a key in the user's file \a name below the configuration directories; empty for none.
QString setting(const QString &name, const QString &key)
{
    const QString file = QStandardPaths::locate(QStandardPaths::GenericConfigLocation, name);
    return file.isEmpty() ? QString() : QSettings(file, QSettings::IniFormat).value(key).toString();
}

QStringList themeFolders()
{
    QStringList folders = {QDir::homePath() + QStringLiteral("/.icons")};
    const QStringList data = QStandardPaths::standardLocations(QStandardPaths::GenericDataLocation);
    for (const QString &folder : data)
        folders.append(folder + QStringLiteral("/icons"));
    return folders;
}

bool isInstalled(const QString &theme)
{
    const QStringList folders = themeFolders();
    for (const QString &folder : folders) {
        if (QFileInfo::exists(folder + QLatin1Char('/') + theme + QStringLiteral("/index.theme")))
            return true;
    }
    return false;
}

} // namespace

QString IconFiles::userTheme()
{
    QStringList names;
    if (qgetenv("XDG_CURRENT_DESKTOP").split(':').contains("KDE"))
        names.append(setting(QStringLiteral("kdeglobals"), QStringLiteral("Icons/Theme")));
    for (const char *toolkit : {"gtk-3.0", "gtk-4.0"})
        names.append(setting(QLatin1String(toolkit) + QStringLiteral("/settings.ini"),
                             QStringLiteral("Settings/gtk-icon-theme-name")));
    for (const char *name : {"Adwaita", "breeze"})
        names.append(QLatin1String(name));
    for (const QString &name : qAsConst(names)) {
        if (!name.isEmpty() && isInstalled(name))
            return name;
    }
    return QStringLiteral("hicolor");
}

void IconFiles::setTheme(const QString &name)
{
    QIcon::setThemeSearchPaths(themeFolders());
    QIcon::setFallbackSearchPaths({QStringLiteral("/usr/share/pixmaps")});
    QIcon::setFallbackThemeName(QStringLiteral("hicolor"));
    QIcon::setThemeName(name);
}

QString IconFiles::find(const QString &name, int size, bool onlyPictures)
{
    // Whether there is such a file is for the one that shows it to find out.
    if (!onlyPictures && QFileInfo(name).isAbsolute())
        return name;
    const VelIconTheme &theme = VelIconTheme::current(VelIconTheme::NoForceLoad);
    return QString::fromStdString(theme.getIconFile(
        name.toStdString(), size, onlyPictures ? VelIconTheme::PictureFiles : VelIconTheme::AllIconFiles));
}
