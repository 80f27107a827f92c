// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>
#include <QStringList>

/**
 * The order of a folder as its record file keeps it.
 */
namespace FolderOrder {

/**
 * Makes \a list the `SortOrder` of the directory \a folder. A record file is made where there is
 * none; where there is one, all else in it stays.
 *
 * @return whether it was saved
 */
bool write(const QString &folder, const QStringList &list);

/// What the user is to hear when it was not.
QString notSaved(const QString &folder);

} // namespace FolderOrder
