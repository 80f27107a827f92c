// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ExactTree.h"

#include <QFile>
#include <QStringList>

#include <algorithm>

#include <dirent.h>
#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

namespace {

QByteArray bytesOf(const QByteArray &path)
{
    QByteArray bytes;
    const int fd = open(path.constData(), O_RDONLY | O_CLOEXEC | O_NONBLOCK);
    char buffer[1 << 14];
    ssize_t count = 0;
    while (fd >= 0 && (count = read(fd, buffer, sizeof buffer)) > 0)
        bytes.append(buffer, int(count));
    if (fd >= 0)
        close(fd);
    return bytes;
}

QByteArray linkTextOf(const QByteArray &path)
{
    char buffer[4096];
    const ssize_t size = readlink(path.constData(), buffer, sizeof buffer);
    return QByteArray(buffer, int(std::max<ssize_t>(size, 0)));
}

} // namespace

ExactTree ExactTree::of(const QString &path)
{
    ExactTree tree;
    tree.add(path);
    return tree;
}

void ExactTree::add(const QString &path)
{
    add(QFile::encodeName(path));
}

void ExactTree::add(const QByteArray &path)
{
    struct stat status = {};
    if (lstat(path.constData(), &status) != 0)
        return;
    Item item;
    item.mode = status.st_mode;
    item.number = status.st_ino;
    if (S_ISREG(status.st_mode))
        item.modified = status.st_mtim;
    if (S_ISLNK(status.st_mode))
        item.bytes = linkTextOf(path);
    else if (S_ISREG(status.st_mode))
        item.bytes = bytesOf(path);
    m_items.insert(path, item);
    if (!S_ISDIR(status.st_mode))
        return;
    DIR *const folder = opendir(path.constData());
    while (const dirent *entry = folder ? readdir(folder) : nullptr) {
        const QByteArray name(entry->d_name);
        if (name != "." && name != "..")
            add(path + '/' + name);
    }
    if (folder)
        closedir(folder);
}

QString ExactTree::difference(const ExactTree &found, const QSet<QByteArray> &rewritten) const
{
    QStringList lines;
    const auto say = [&lines](const char *what, const QByteArray &path) {
        lines.append(QLatin1String(what) + QString::fromLatin1(path));
    };
    for (auto it = m_items.begin(); it != m_items.end(); ++it) {
        const auto other = found.m_items.constFind(it.key());
        if (other == found.m_items.constEnd()) {
            say("missing: ", it.key());
            continue;
        }
        if (it->mode != other->mode)
            say("other permissions: ", it.key());
        if (it->bytes != other->bytes)
            say("other bytes: ", it.key() + ": " + other->bytes + " instead of " + it->bytes);
        if (it->modified.tv_sec != other->modified.tv_sec || it->modified.tv_nsec != other->modified.tv_nsec)
            say("other time: ", it.key());
        if (it->number != other->number && !rewritten.contains(it.key()) && !rewritten.contains("*"))
            say("another file: ", it.key());
    }
    for (auto it = found.m_items.begin(); it != found.m_items.end(); ++it) {
        if (!m_items.contains(it.key()))
            say("not expected: ", it.key());
    }
    return lines.join(QLatin1Char('\n'));
}

QMap<QByteArray, ino_t> ExactTree::numbers() const
{
    QMap<QByteArray, ino_t> numbers;
    for (auto it = m_items.begin(); it != m_items.end(); ++it)
        numbers.insert(it.key(), it->number);
    return numbers;
}

QSet<QByteArray> ExactTree::contents() const
{
    QSet<QByteArray> contents;
    for (const Item &item : m_items) {
        if (S_ISREG(item.mode))
            contents.insert(item.bytes);
    }
    return contents;
}
