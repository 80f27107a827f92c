// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include <velintegration/desktopitems.h>

#include <velcore/dirs.h>

#include <QByteArray>
#include <QDir>
#include <QFile>
#include <QList>
#include <QSaveFile>
#include <QString>

#include <algorithm>
#include <optional>

#include <fcntl.h>
#include <sys/file.h>
#include <unistd.h>

namespace {

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
std::optional<QList<QByteArray>> readLines(const QString &path)
{
    QFile file(path);
    if (!file.exists())
        return QList<QByteArray>();
    if (!file.open(QIODevice::ReadOnly))
        return {};
    QByteArray bytes = file.readAll();
    if (file.error() != QFileDevice::NoError)
        return {};
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

// flush() is asked because commit() does not see that a full disk took the buffer in part.
bool writeLines(const QString &path, const QList<QByteArray> &lines)
{
    QSaveFile file(path);
    const QByteArray bytes = lines.join('\n') + '\n';
    return file.open(QIODevice::WriteOnly) && file.write(bytes) == bytes.size() && file.flush()
        && file.commit();
}

// Holds off other programs that save a position between our reading and our writing.
class FolderLock
{
public:
    explicit FolderLock(const QString &folder)
        : m_descriptor(open(QFile::encodeName(folder).constData(), O_RDONLY | O_DIRECTORY | O_CLOEXEC))
    {
        if (m_descriptor >= 0)
            flock(m_descriptor, LOCK_EX);
    }
    ~FolderLock()
    {
        if (m_descriptor >= 0)
            close(m_descriptor);
    }
    Q_DISABLE_COPY(FolderLock)

private:
    int m_descriptor;
};

} // namespace

bool SaveDesktopItemPosition(const char *fileName, int x, int y)
{
    const QString root = configurationRoot();
    if (!fileName || !*fileName || !QDir().mkpath(root))
        return false;
    const FolderLock lock(root);
    std::optional<QList<QByteArray>> lines = readLines(filePath(root));
    if (!lines)
        return false;
    setPosition(&*lines, QByteArray(fileName), x, y);
    return writeLines(filePath(root), *lines);
}

bool ReadDesktopItemPosition(const char *fileName, int *x, int *y)
{
    if (!fileName || !*fileName)
        return false;
    const std::optional<QList<QByteArray>> lines = readLines(filePath(configurationRoot()));
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
