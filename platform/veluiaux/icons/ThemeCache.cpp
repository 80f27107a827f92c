// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ThemeCache.h"

#include <QDateTime>
#include <QFileInfo>

#include <cstring>

namespace {

constexpr std::uint32_t MajorVersion = 1;
constexpr std::uint32_t HashPlace = 4;
constexpr std::uint32_t FoldersPlace = 8;
constexpr std::uint32_t Word = 4;
constexpr qint64 LargestSize = 64 * 1024 * 1024;

std::uint32_t hashOf(const QByteArray &name)
{
    std::uint32_t hash = 0;
    for (const char c : name)
        hash = hash * 31 + std::uint32_t(static_cast<signed char>(c));
    return hash;
}

} // namespace

ThemeCache::ThemeCache(const QString &folder)
    : m_file(folder + QLatin1String("/icon-theme.cache"))
{
    // Opening a pipe would wait for whoever writes into it.
    if (!QFileInfo(m_file).isFile() || m_file.size() > LargestSize || !m_file.open(QIODevice::ReadOnly))
        return;
    m_size = std::uint32_t(m_file.size());
    m_bytes = m_file.map(0, m_size);
    if (m_bytes && (number(0, 2) != MajorVersion || !isUpToDate(folder)))
        m_bytes = nullptr;
}

bool ThemeCache::isUpToDate(const QString &folder) const
{
    const QDateTime modified = QFileInfo(m_file).lastModified();
    const auto list = number(FoldersPlace);
    const auto count = list ? number(*list) : std::nullopt;
    if (!count || modified < QFileInfo(folder).lastModified())
        return false;
    for (std::uint32_t i = 0; i < *count; ++i) {
        const auto name = this->folder(i);
        if (!name
            || modified < QFileInfo(folder + QLatin1Char('/') + QString::fromUtf8(*name)).lastModified())
            return false;
    }
    return true;
}

std::optional<QVector<QString>> ThemeCache::foldersOf(const QString &name) const
{
    if (!m_bytes)
        return std::nullopt;
    const QByteArray wanted = name.toUtf8();
    const auto hash = number(HashPlace);
    const auto count = hash ? number(*hash) : std::nullopt;
    if (!count || *count == 0)
        return std::nullopt;
    auto place = number(*hash + Word + hashOf(wanted) % *count * Word);
    // A chain in a circle would never end.
    for (std::uint32_t steps = 0; place && *place != 0 && *place < m_size && steps < m_size; ++steps) {
        const auto nameAt = number(*place + Word);
        if (nameAt && text(*nameAt) == wanted) {
            const auto list = number(*place + 2 * Word);
            return list ? foldersAt(*list) : std::nullopt;
        }
        place = number(*place);
    }
    return QVector<QString>();
}

std::optional<QVector<QString>> ThemeCache::foldersAt(std::uint32_t list) const
{
    const auto count = number(list);
    QVector<QString> folders;
    for (std::uint32_t i = 0; count && i < *count; ++i) {
        const auto index = number(list + Word + 2 * Word * i, 2);
        const auto name = index ? folder(*index) : std::nullopt;
        if (!name)
            return std::nullopt;
        folders.append(QString::fromUtf8(*name));
    }
    return folders;
}

std::optional<QByteArray> ThemeCache::folder(std::uint32_t index) const
{
    const auto list = number(FoldersPlace);
    const auto count = list ? number(*list) : std::nullopt;
    const auto name = count && index < *count ? number(*list + Word + Word * index) : std::nullopt;
    return name ? text(*name) : std::nullopt;
}

// The highest byte comes first.
std::optional<std::uint32_t> ThemeCache::number(std::uint32_t offset, int bytes) const
{
    if (!m_bytes || offset >= m_size || m_size - offset < std::uint32_t(bytes))
        return std::nullopt;
    std::uint32_t value = 0;
    for (int i = 0; i < bytes; ++i)
        value = value << 8 | m_bytes[offset + std::uint32_t(i)];
    return value;
}

std::optional<QByteArray> ThemeCache::text(std::uint32_t offset) const
{
    if (!m_bytes || offset >= m_size)
        return std::nullopt;
    const auto *const begin = reinterpret_cast<const char *>(m_bytes + offset);
    const auto *const end = static_cast<const char *>(std::memchr(begin, 0, m_size - offset));
    return end ? std::make_optional(QByteArray(begin, int(end - begin))) : std::nullopt;
}
