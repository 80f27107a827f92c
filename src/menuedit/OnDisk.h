// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>

/**
 * What is on disk. A link that leads nowhere is there like any other file, which the functions
 * of Qt deny.
 */
namespace OnDisk {

/// Whether there is anything at \a path.
bool exists(const QString &path);

} // namespace OnDisk
