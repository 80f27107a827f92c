// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>

#include <functional>

/**
 * The file name of something new. That of a new folder or entry is "group" or "shortcut", a number
 * (none for the first) and for an entry ".desktop".
 */
namespace FreeName {

enum class Kind { Folder, Entry };

struct Name
{
    /// The file name, without a path.
    QString fileName;
    /// The number in it as text; empty for the first.
    QString number;
};

/// The first name of \a kind that is not \a taken.
Name first(Kind kind, const std::function<bool(const QString &fileName)> &taken);

/// The first name that is not \a taken for something of \a kind that is like the one called
/// \a fileName: that name with "-2" or the next number before its suffix. Never longer than a file
/// system allows.
QString like(const QString &fileName, Kind kind, const std::function<bool(const QString &fileName)> &taken);

/// The first name of \a kind that nothing in the directory \a folder has, not even a link
/// that leads nowhere: a new file would be written to where it points.
Name firstIn(const QString &folder, Kind kind);

} // namespace FreeName
