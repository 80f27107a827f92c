// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TreeState.h"

#include "StagingFolder.h"
#include "TreeLimits.h"

#include <algorithm>
#include <array>
#include <climits>
#include <memory>

#include <dirent.h>
#include <sys/stat.h>
#include <unistd.h>

namespace {

// Not every file system keeps parts of a second, so what was moved there and back has lost them.
bool isSameTime(const timespec &left, const timespec &right)
{
    return left.tv_sec == right.tv_sec
        && (left.tv_nsec == right.tv_nsec || left.tv_nsec == 0 || right.tv_nsec == 0);
}

QByteArray linkTextOf(const QByteArray &path)
{
    std::array<char, PATH_MAX> text;
    const ssize_t size = ::readlink(path.constData(), text.data(), text.size());
    return size < 0 ? QByteArray() : QByteArray(text.data(), int(size));
}

QVector<QByteArray> namesIn(const QByteArray &folder)
{
    QVector<QByteArray> names;
    const std::unique_ptr<DIR, int (*)(DIR *)> stream(::opendir(folder.constData()), ::closedir);
    while (const dirent *entry = stream ? ::readdir(stream.get()) : nullptr) {
        const QByteArray name(entry->d_name);
        if (name != "." && name != ".." && !StagingFolder::isNameOfOne(entry->d_name))
            names.append(name);
    }
    std::sort(names.begin(), names.end());
    return names;
}

} // namespace

QByteArray TreeState::linkTextAt(const QString &path)
{
    return linkTextOf(QFile::encodeName(path));
}

TreeState::TreeState(const TreeCopy::Path &path)
{
    struct stat status = {};
    if (::lstat(path.c_str(), &status) != 0)
        return;
    m_device = status.st_dev;
    m_inode = status.st_ino;
    add(QByteArray::fromStdString(path.string()), QByteArray(), 0);
}

TreeState::TreeState(const QString &path)
    : TreeState(TreeCopy::Path(QFile::encodeName(path).toStdString()))
{
}

bool TreeState::Item::operator==(const Item &other) const
{
    return name == other.name && mode == other.mode && size == other.size
        && isSameTime(modified, other.modified) && linkText == other.linkText;
}

// False when that was too much.
bool TreeState::add(const QByteArray &path, const QByteArray &name, int level)
{
    struct stat status = {};
    if (::lstat(path.constData(), &status) != 0)
        return true;
    Item item;
    item.name = name;
    item.mode = status.st_mode;
    if (S_ISREG(status.st_mode)) {
        item.size = status.st_size;
        item.modified = status.st_mtim;
    } else if (S_ISLNK(status.st_mode)) {
        item.linkText = linkTextOf(path);
    }
    m_items.append(item);
    m_isWhole = m_isWhole && !TreeLimits::areMet(level, m_items.size());
    if (m_isWhole && S_ISDIR(status.st_mode))
        addChildren(path, name, level);
    return m_isWhole;
}

void TreeState::addChildren(const QByteArray &path, const QByteArray &name, int level)
{
    const QVector<QByteArray> children = namesIn(path);
    for (const QByteArray &child : children) {
        if (!add(path + '/' + child, name.isEmpty() ? child : name + '/' + child, level + 1))
            return;
    }
}

bool TreeState::operator==(const TreeState &other) const
{
    if (m_isWhole && other.m_isWhole)
        return m_items == other.m_items;
    return m_isWhole == other.m_isWhole && m_device == other.m_device && m_inode == other.m_inode;
}

bool TreeState::isFolder() const
{
    return exists() && S_ISDIR(m_items.constFirst().mode);
}

bool TreeState::isLink() const
{
    return exists() && S_ISLNK(m_items.constFirst().mode);
}

QByteArray TreeState::linkText() const
{
    return exists() ? m_items.constFirst().linkText : QByteArray();
}

int TreeState::shownItems() const
{
    const auto isShown = [](const Item &item) {
        return !item.name.isEmpty() && !item.name.startsWith('.') && !item.name.contains("/.");
    };
    return int(std::count_if(m_items.begin(), m_items.end(), isShown));
}

bool TreeState::isAt(const TreeCopy::Path &path) const
{
    struct stat status = {};
    if (!exists() || ::lstat(path.c_str(), &status) != 0)
        return false;
    const bool isSameKind = (status.st_mode & S_IFMT) == (m_items.constFirst().mode & S_IFMT);
    if (isSameKind && status.st_dev == m_device && status.st_ino == m_inode)
        return true;
    return *this == TreeState(path);
}
