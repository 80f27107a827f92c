// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QFile>
#include <QString>
#include <QVector>

#include <cstdint>
#include <optional>

/**
 * The file "icon-theme.cache" of a theme's folder, which tells where in it an icon has files.
 *
 * It counts while it is younger than the folder and all folders in it that it names. May be
 * damaged: then it counts for nothing.
 */
class ThemeCache
{
public:
    explicit ThemeCache(const QString &folder);

    /// The folders with files for the icon \a name; nothing when there is no cache that counts.
    std::optional<QVector<QString>> foldersOf(const QString &name) const;

private:
    std::optional<std::uint32_t> number(std::uint32_t offset, int bytes = 4) const;
    std::optional<QByteArray> text(std::uint32_t offset) const;
    std::optional<QByteArray> folder(std::uint32_t index) const;
    std::optional<QVector<QString>> foldersAt(std::uint32_t list) const;
    bool isUpToDate(const QString &folder) const;

    QFile m_file;
    const uchar *m_bytes = nullptr; ///< null when there is no cache that counts
    std::uint32_t m_size = 0;
};
