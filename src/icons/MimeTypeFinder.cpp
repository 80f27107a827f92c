// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MimeTypeFinder.h"

#include <QDateTime>
#include <QFile>
#include <QMimeDatabase>
#include <QStandardPaths>
#include <QStringList>

#include <sys/stat.h>

namespace {

constexpr qint64 LongestMemory = 1000; // milliseconds
constexpr qint64 LargestCache = 64 * 1024 * 1024; // a hundred times what is common

/// Stands for the contents of a file and tells whether anyone wanted to see them.
class WatchedContents : public QIODevice
{
public:
    WatchedContents() { open(QIODevice::ReadOnly); }
    bool wereAskedFor() const { return m_askedFor; }

protected:
    qint64 readData(char *, qint64) override
    {
        m_askedFor = true;
        return 0;
    }
    qint64 writeData(const char *, qint64) override { return -1; }

private:
    bool m_askedFor = false;
};

QStringList mimeDirectories()
{
    return QStandardPaths::locateAll(QStandardPaths::GenericDataLocation, QStringLiteral("mime"),
                                     QStandardPaths::LocateDirectory);
}

/// Changes when one of the caches does; empty when the database does not read (only) caches.
QString stampOf(const QStringList &directories)
{
    if (!qEnvironmentVariableIsEmpty("QT_NO_MIME_CACHE"))
        return QString();
    QString stamp;
    bool hasCommonTypes = false;
    for (const QString &directory : directories) {
        const QFileInfo cache(directory + QStringLiteral("/mime.cache"));
        if (!cache.isFile() || cache.size() > LargestCache)
            return QString();
        stamp += cache.filePath() + QLatin1Char('|')
            + QString::number(cache.lastModified().toMSecsSinceEpoch()) + QLatin1Char('|')
            + QString::number(cache.size()) + QLatin1Char('\n');
        hasCommonTypes =
            hasCommonTypes || QFileInfo::exists(directory + QStringLiteral("/packages/freedesktop.org.xml"));
    }
    // Without them the database falls back on a copy of its own.
    return hasCommonTypes ? stamp : QString();
}

/// Whether \a path is, right now, a file whose contents can be asked for.
bool isRegular(const QString &path)
{
    struct stat status;
    return ::stat(QFile::encodeName(path).constData(), &status) == 0 && S_ISREG(status.st_mode);
}

} // namespace

MimeTypeFinder &MimeTypeFinder::instance()
{
    static MimeTypeFinder finder;
    return finder;
}

QMimeType MimeTypeFinder::typeOf(const QFileInfo &info)
{
    refresh();
    if (info.isDir()) {
        if (!m_directoryType.isValid())
            m_directoryType = QMimeDatabase().mimeTypeForFile(info);
        return m_directoryType;
    }
    return isRegular(info.filePath()) ? typeOfRegularFile(info) : QMimeDatabase().mimeTypeForFile(info);
}

QMimeType MimeTypeFinder::typeOfRegularFile(const QFileInfo &info)
{
    refresh();
    if (m_patterns && !info.filePath().startsWith(QLatin1Char(':'))) {
        const QMimeType type = typeByName(info.fileName());
        if (type.isValid())
            return type;
    }
    return QMimeDatabase().mimeTypeForFile(info);
}

QMimeType MimeTypeFinder::typeByName(const QString &name)
{
    const int length = m_patterns->decidingSuffix(name);
    if (length == 0)
        return QMimeType();
    const QString suffix = name.right(length);
    const auto known = m_types.constFind(suffix);
    if (known != m_types.constEnd())
        return *known;

    WatchedContents contents;
    QMimeType type = QMimeDatabase().mimeTypeForFileNameAndData(name, &contents);
    if (contents.wereAskedFor())
        type = QMimeType();
    m_types.insert(suffix, type);
    return type;
}

void MimeTypeFinder::refresh()
{
    if (m_age.isValid() && m_age.elapsed() < LongestMemory)
        return;
    m_age.start();
    m_types.clear();
    m_directoryType = QMimeType();
    readPatterns();
}

void MimeTypeFinder::readPatterns()
{
    const QStringList directories = mimeDirectories();
    const QString stamp = stampOf(directories);
    if (m_patterns && stamp == m_stamp)
        return;
    m_stamp = stamp;
    m_patterns.reset();
    if (stamp.isEmpty())
        return;
    auto patterns = std::make_unique<MimePatterns>();
    for (const QString &directory : directories) {
        QFile file(directory + QStringLiteral("/mime.cache"));
        if (!file.open(QIODevice::ReadOnly) || file.size() > LargestCache
            || !patterns->addCache(file.readAll()))
            return;
    }
    patterns->finish();
    m_patterns = std::move(patterns);
}
