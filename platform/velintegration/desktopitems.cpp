// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include <velintegration/desktopitems.h>

#include <velcore/dirs.h>
#include <velcore/files.h>
#include <velcore/folderlock.h>

#include <QByteArray>
#include <QDir>
#include <QFile>
#include <QList>
#include <QSaveFile>
#include <QString>

#include <algorithm>
#include <optional>

#include <sys/xattr.h>
#include <unistd.h>

namespace {

// So often a saving starts anew because another program was faster.
constexpr int MostAttempts = 10;

struct Item
{
    int x = 0;
    int y = 0;
    QByteArray escapedName;
};

QString configurationRoot()
{
    return QFile::decodeName(GetVelDir(VelDir::WindowManagerConfig).c_str());
}

QString filePath(const QString &root)
{
    return root + QLatin1String("/desktopitems");
}

std::string encoded(const QString &path)
{
    return QFile::encodeName(path).toStdString();
}

std::optional<Item> parsed(const QByteArray &line)
{
    const QList<QByteArray> words = line.split(' ');
    if (words.size() != 3)
        return {};
    bool goodX = false;
    bool goodY = false;
    const Item item = {words.at(0).toInt(&goodX), words.at(1).toInt(&goodY), words.at(2)};
    return goodX && goodY ? std::optional<Item>(item) : std::nullopt;
}

bool isLineOf(const QByteArray &line, const QByteArray &name)
{
    const std::optional<Item> item = parsed(line);
    return item && QByteArray::fromPercentEncoding(item->escapedName) == name;
}

QByteArray lineOf(const QByteArray &name, int x, int y)
{
    return QByteArray::number(x) + ' ' + QByteArray::number(y) + ' ' + name.toPercentEncoding();
}

// The lines without their ends; none for a file that does not exist, nothing when it cannot be read.
std::optional<QList<QByteArray>> linesOf(const Vel::SmallFile &file)
{
    if (file.isMissing())
        return QList<QByteArray>();
    if (!file.isRead())
        return {};
    QByteArray bytes = QByteArray::fromStdString(file.bytes());
    if (bytes.endsWith('\n'))
        bytes.chop(1);
    return bytes.isEmpty() ? QList<QByteArray>() : bytes.split('\n');
}

void setPosition(QList<QByteArray> *lines, const QByteArray &name, int x, int y)
{
    const auto isOurs = [&name](const QByteArray &line) { return isLineOf(line, name); };
    const auto first = std::find_if(lines->begin(), lines->end(), isOurs);
    if (first == lines->end()) {
        lines->append(lineOf(name, x, y));
        return;
    }
    *first = lineOf(name, x, y);
    lines->erase(std::remove_if(first + 1, lines->end(), isOurs), lines->end());
}

// With an access list the group's bits are its mask, which may allow more than the group itself
// could do; the new file has no list.
bool narrowPermissions(QSaveFile *file)
{
    return getxattr(QFile::encodeName(file->fileName()).constData(), "system.posix_acl_access", nullptr, 0)
        <= 0
        || file->setPermissions(QFile::ReadOwner | QFile::WriteOwner);
}

// flush() is asked because commit() does not see that a full disk took the buffer in part. Synced
// here, so that the lock is not held for as long as that takes.
bool writeLines(QSaveFile *file, const QList<QByteArray> &lines)
{
    const QByteArray bytes = lines.join('\n') + '\n';
    return std::size_t(bytes.size()) <= Vel::SmallFile::LargestSize && file->open(QIODevice::WriteOnly)
        && narrowPermissions(file) && file->write(bytes) == bytes.size() && file->flush()
        && fsync(file->handle()) == 0;
}

} // namespace

bool SaveDesktopItemPosition(const char *fileName, int x, int y)
{
    const QString root = configurationRoot();
    const QString path = filePath(root);
    if (!fileName || !*fileName || !QDir().mkpath(root) || Vel::leadsThroughPlantedLink(encoded(path)))
        return false;
    // Taken only when the new file is on disk: nobody else waits for that. When another program was
    // faster, all is done once more, now with the lock.
    std::optional<Vel::FolderLock> lock;
    for (int attempt = 1;; ++attempt) {
        const Vel::SmallFile old(encoded(path));
        std::optional<QList<QByteArray>> lines = linesOf(old);
        if (!lines)
            return false;
        setPosition(&*lines, QByteArray(fileName), x, y);
        QSaveFile file(path);
        if (!writeLines(&file, *lines))
            return false;
        if (!lock || !lock->isHeld())
            lock.emplace(encoded(root));
        if (attempt == MostAttempts || old.isUnchanged())
            return file.commit();
    }
}

bool ReadDesktopItemPosition(const char *fileName, int *x, int *y)
{
    if (!fileName || !*fileName)
        return false;
    const std::optional<QList<QByteArray>> lines =
        linesOf(Vel::SmallFile(encoded(filePath(configurationRoot()))));
    if (!lines)
        return false;
    const QByteArray name(fileName);
    const auto found = std::find_if(lines->begin(), lines->end(),
                                    [&name](const QByteArray &line) { return isLineOf(line, name); });
    if (found == lines->end())
        return false;
    const std::optional<Item> item = parsed(*found);
    if (x)
        *x = item->x;
    if (y)
        *y = item->y;
    return true;
}
