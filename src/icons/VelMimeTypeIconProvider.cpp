// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "VelMimeTypeIconProvider.h"

#include "MimeTypeFinder.h"

#include <frame/DesktopEntryRecord.h>
#include <frame/EntryPath.h>

#include <velcore/dirs.h>
#include <veluiaux/VelIcon.h>
#include <veluiaux/VelIconTheme.h>
#include <veluiaux/VelTrash.h>

#include <QFile>
#include <QFileInfo>
#include <QPainter>
#include <QPixmap>

namespace {

QIcon builtInIcon(const QStringList &names)
{
    const QString directory = QString::fromStdString(GetVelDir(VelDir::Pictures));
    QIcon icon;
    for (const QString &name : names) {
        // A missing file would make an icon that is not null and has no pixmap.
        if (QFile::exists(directory + name))
            icon.addFile(directory + name);
    }
    return icon;
}

/// A rule across the middle, two pixels high.
QPixmap separatorPixmap(int size)
{
    QPixmap pixmap(size, size);
    pixmap.fill(Qt::transparent);
    QPainter painter(&pixmap);
    painter.drawLine(0, size / 2 - 1, size, size / 2 - 1);
    painter.drawLine(0, size / 2, size, size / 2);
    return pixmap;
}

QIcon drawnSeparator()
{
    QIcon icon;
    for (const int size : {16, 22, 32, 48, 64, 128})
        icon.addPixmap(separatorPixmap(size));
    return icon;
}

QString themeName(QFileIconProvider::IconType type)
{
    switch (type) {
    case QFileIconProvider::Computer:
        return QStringLiteral("computer");
    case QFileIconProvider::Desktop:
        return QStringLiteral("user-desktop");
    case QFileIconProvider::Trashcan:
        return VelTrash::isEmpty() ? QStringLiteral("user-trash") : QStringLiteral("user-trash-full");
    case QFileIconProvider::Network:
        return QStringLiteral("network-wired");
    case QFileIconProvider::Drive:
        return QStringLiteral("drive-harddisk");
    case QFileIconProvider::Folder:
        return QStringLiteral("folder");
    case QFileIconProvider::File:
        break;
    }
    return QStringLiteral("unknown");
}

} // namespace

VelMimeTypeIconProvider::VelMimeTypeIconProvider()
    : folderIcon(builtInIcon({QStringLiteral("/folder16.xpm"), QStringLiteral("/folder32.xpm")}))
    , fileIcon(builtInIcon({QStringLiteral("/icon16.xpm"), QStringLiteral("/icon32.xpm")}))
    , separatorIcon(drawnSeparator())
{
}

VelMimeTypeIconProvider::~VelMimeTypeIconProvider() = default;

QIcon VelMimeTypeIconProvider::icon(IconType type) const
{
    // QIcon::fromTheme() with a fallback decides in the same way, but has the style draw the
    // fallback even where the theme has the icon.
    QIcon icon = QIcon::fromTheme(themeName(type));
    if (icon.isNull() || icon.availableSizes().isEmpty())
        return QFileIconProvider::icon(type);
    return icon;
}

QIcon VelMimeTypeIconProvider::icon(const QFileInfo &info) const
{
    if (!info.exists()) {
        return VelIcon::fromTheme(QStringLiteral("unknown"),
                                  qMakePair(Qt::TopRightCorner, QStringLiteral("emblem-unreadable")),
                                  QIcon());
    }
    Emblems emblems;
    if (info.isSymLink())
        emblems.insert(Qt::BottomLeftCorner, QStringLiteral("emblem-symbolic-link"));
    if (info.isDir())
        return directoryIcon(info, emblems);
    if (!info.isFile())
        return VelIcon::withEmblems(fileIcon, emblems);
    if (EntryPath::isEntry(info.fileName()))
        return desktopEntryIcon(VelUIDesktopEntry(info.absoluteFilePath()), emblems);
    return regularFileIcon(info, emblems);
}

QString VelMimeTypeIconProvider::type(const QFileInfo &info) const
{
    return MimeTypeFinder::instance().typeOf(info).name();
}

QString VelMimeTypeIconProvider::regularFileType(const QFileInfo &info) const
{
    return MimeTypeFinder::instance().typeOfRegularFile(info).name();
}

QIcon VelMimeTypeIconProvider::directoryIcon(const QFileInfo &info, const Emblems &emblems) const
{
    // Without a record file it is empty.
    const QString name = VelUIDesktopEntry(EntryPath::recordFileOf(info.absoluteFilePath())).getIcon();
    return name.isEmpty() ? VelIcon::withEmblems(folderIcon, emblems)
                          : VelIcon::fromTheme(name, emblems, folderIcon);
}

QIcon VelMimeTypeIconProvider::regularFileIcon(const QFileInfo &info, const Emblems &emblems) const
{
    const QMimeType type = MimeTypeFinder::instance().typeOf(info);
    return type.isValid() ? VelIcon::fromTheme(type.iconName(), emblems, fileIcon)
                          : VelIcon::withEmblems(fileIcon, emblems);
}

QIcon VelMimeTypeIconProvider::desktopEntryIcon(const VelUIDesktopEntry &entry, const Emblems &emblems) const
{
    const QString name = entry.getIcon();
    if (!name.isEmpty())
        return VelIcon::fromTheme(name, emblems, fileIcon);
    if (entry.getType() == QLatin1String("Link")) {
        const QByteArray url = entry.getURL().toLocal8Bit();
        const std::string urlIcon =
            VelIconTheme::current(VelIconTheme::NoForceLoad).getURLIconName(url.constData(), nullptr);
        return VelIcon::fromTheme(QString::fromStdString(urlIcon), emblems, QIcon());
    }
    if (entry.getExec() == QLatin1String("VELWM_SEPARATOR"))
        return separatorIcon;
    return VelIcon::withEmblems(fileIcon, emblems);
}
