// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuIconProvider.h"

#include "NewIcons.h"
#include "RowCache.h"
#include "VelMimeTypeIconProvider.h"

#include <frame/DesktopEntryRecord.h>
#include <frame/EntryPath.h>

#include <QFileInfo>
#include <QPointer>

#include <utility>

namespace {

class Provider : public VelMimeTypeIconProvider
{
public:
    explicit Provider(RowCache *cache)
        : m_cache(cache)
        , m_new(new NewIcons(cache))
    {
    }

    using VelMimeTypeIconProvider::icon;
    QIcon icon(const QFileInfo &info) const override
    {
        if (!m_cache)
            return VelMimeTypeIconProvider::icon(info);
        const QString path = rowPathOf(info);
        // It has no row that an icon would stand in.
        if (EntryPath::isRecordFile(path)) {
            m_cache->noteListed(path, QIcon());
            return QIcon();
        }
        const bool isEntry = EntryPath::isEntry(path) && !info.isSymLink() && info.isFile();
        const QIcon icon = isEntry ? entryIcon(path) : VelMimeTypeIconProvider::icon(info);
        m_cache->noteListed(path, icon);
        return icon;
    }

    // The file model asks for the icon and at once for the type.
    QString type(const QFileInfo &info) const override
    {
        if (m_cache && EntryPath::isRecordFile(rowPathOf(info)))
            return QStringLiteral("application/x-desktop");
        const QString regularFile = std::exchange(m_regularFile, QString());
        const QString name = !regularFile.isEmpty() && regularFile == rowPathOf(info)
            ? regularFileType(info)
            : VelMimeTypeIconProvider::type(info);
        // It makes no row for a file without a type, and every file is without where no MIME types
        // are installed.
        return name.isEmpty() ? QStringLiteral("application/octet-stream") : name;
    }

private:
    static bool isDotFile(const QString &path)
    {
        return path.mid(path.lastIndexOf(QLatin1Char('/')) + 1).startsWith(QLatin1Char('.'));
    }

    // What the file model was asked about by its path has the root's "/" twice.
    static QString rowPathOf(const QFileInfo &info)
    {
        const QString path = info.filePath();
        return path.startsWith(QLatin1String("//")) ? path.mid(1) : path;
    }

    QIcon entryIcon(const QString &path) const
    {
        m_regularFile = path;
        if (const std::optional<QIcon> known = knownIcon(path))
            return *known;
        // A dot file has no row with which its icon would be forgotten.
        const bool isKept = !isDotFile(path);
        if (isKept)
            m_new->begin(path);
        const VelUIDesktopEntry entry(path);
        if (!m_cache->display(path))
            m_cache->prefetch(path, RowCache::Display::of(entry));
        const QIcon icon = sharedIcon(entry);
        if (isKept)
            m_new->end(icon);
        return icon;
    }

    // Of a row that is listed for the first time no file need be looked at.
    std::optional<QIcon> knownIcon(const QString &path) const
    {
        if (m_cache->hasNewIcon(path))
            m_new->finish(path);
        return m_cache->hasIcon(path) ? m_cache->icon(path, FileIdentity(path)) : std::nullopt;
    }

    // Most rows of a folder have one of few icons.
    QIcon sharedIcon(const VelUIDesktopEntry &entry) const
    {
        const QString name = entry.getIcon();
        if (name.isEmpty())
            return desktopEntryIcon(entry, {});
        const std::optional<QIcon> known = m_cache->sharedIcon(name);
        if (known)
            return *known;
        const QIcon icon = desktopEntryIcon(entry, {});
        m_cache->shareIcon(name, icon);
        return icon;
    }

    const QPointer<RowCache> m_cache;
    NewIcons *m_new; // as long as the cache is there
    // The regular file that was just looked at for its icon.
    mutable QString m_regularFile;
};

} // namespace

MenuIconProvider::MenuIconProvider(RowCache *cache, QObject *parent)
    : QObject(parent)
    , m_provider(std::make_unique<Provider>(cache))
{
}

MenuIconProvider::~MenuIconProvider() = default;
