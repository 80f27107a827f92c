// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FileIdentity.h"

#include <QFile>

#include <algorithm>
#include <ctime>

#include <sys/stat.h>

namespace {

constexpr qint64 LongEnough = 50000000; // nanoseconds

qint64 nanoseconds(const timespec &time)
{
    return qint64(time.tv_sec) * 1000000000 + qint64(time.tv_nsec);
}

} // namespace

FileIdentity::FileIdentity(const QString &path)
{
    struct stat status = {};
    if (::stat(QFile::encodeName(path).constData(), &status) != 0)
        return;
    m_device = status.st_dev;
    m_inode = status.st_ino;
    m_size = status.st_size;
    m_modified = nanoseconds(status.st_mtim);
    m_changed = nanoseconds(status.st_ctim);
    m_isRegularFile = S_ISREG(status.st_mode);
}

bool FileIdentity::operator==(const FileIdentity &other) const
{
    return m_device == other.m_device && m_inode == other.m_inode && m_size == other.m_size
        && m_modified == other.m_modified && m_changed == other.m_changed;
}

quint64 FileIdentity::mark() const
{
    quint64 mark = 0;
    for (const quint64 part : {m_device, m_inode, quint64(m_size), quint64(m_modified), quint64(m_changed)}) {
        // Every bit of the one changes half of those of the other.
        mark += part + 0x9e3779b97f4a7c15U;
        mark = (mark ^ (mark >> 30U)) * 0xbf58476d1ce4e5b9U;
        mark = (mark ^ (mark >> 27U)) * 0x94d049bb133111ebU;
        mark ^= mark >> 31U;
    }
    return mark;
}

bool FileIdentity::isSettledAt(qint64 time) const
{
    return std::max(m_modified, m_changed) + LongEnough < time;
}

qint64 FileIdentity::now()
{
    timespec time = {};
    clock_gettime(CLOCK_REALTIME, &time);
    return nanoseconds(time);
}
