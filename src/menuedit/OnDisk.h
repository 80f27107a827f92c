// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QSet>
#include <QString>

#include <optional>

/**
 * What is on disk. A link that leads nowhere is there like any other file, which the functions
 * of Qt deny.
 */
namespace OnDisk {

/// Whether there is anything at \a path.
bool exists(const QString &path);

/// The names of all that the directory \a folder holds, dot files included; nullopt when it
/// cannot be listed. Looks at no file.
std::optional<QSet<QString>> namesIn(const QString &folder);

} // namespace OnDisk
