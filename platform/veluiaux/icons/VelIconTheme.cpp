// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include <veluiaux/VelIconTheme.h>

#include "IconLookup.h"
#include "ThemeFiles.h"
#include "ThemeState.h"

#include <LocalFile.h>

#include <QFileInfo>
#include <QMimeDatabase>
#include <QString>
#include <QUrl>

#include <algorithm>

namespace {

struct Kind
{
    std::string icon;
    std::string mimeType;
};

Kind kindOf(const QString &text)
{
    const QFileInfo file(localFile(text));
    if (!file.filePath().isEmpty() && file.exists()) {
        const QMimeType type = QMimeDatabase().mimeTypeForFile(file);
        return {type.iconName().toStdString(), type.name().toStdString()};
    }
    const QString scheme = text.startsWith(QLatin1Char('/')) ? QString() : QUrl(text).scheme();
    if (scheme == QLatin1String("http") || scheme == QLatin1String("https"))
        return {"text-html", "text/html"};
    if (scheme == QLatin1String("mailto"))
        return {"mail-message-new", "x-scheme-handler/mailto"};
    return {"unknown", "application/octet-stream"};
}

bool isNoPicture(const ThemeFiles::File &file)
{
    return !file.path.endsWith(QLatin1String(".png"), Qt::CaseInsensitive)
        && !file.path.endsWith(QLatin1String(".xpm"), Qt::CaseInsensitive);
}

} // namespace

VelIconTheme &VelIconTheme::current(ForceLoad force)
{
    static VelIconTheme theme;
    if (force == DoForceLoad)
        ThemeState::reload();
    return theme;
}

std::string VelIconTheme::getURLIconName(const char *url, std::string *mimeType)
{
    Kind kind = kindOf(QString::fromLocal8Bit(url));
    if (mimeType)
        *mimeType = std::move(kind.mimeType);
    return kind.icon;
}

std::string VelIconTheme::getIconFile(const std::string &name, int size, IconFileKinds kinds) const
{
    QVector<ThemeFiles::File> files = IconLookup::filesOf(QString::fromStdString(name));
    if (kinds == PictureFiles)
        files.erase(std::remove_if(files.begin(), files.end(), isNoPicture), files.end());
    const ThemeFiles::File *const file = ThemeFiles::forSize(files, QSize(size, size));
    return file ? file->path.toStdString() : std::string();
}
