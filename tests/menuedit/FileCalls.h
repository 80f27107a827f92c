// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QByteArray>
#include <QList>

/**
 * Tells which files this program looks at while an object lives: the C library's functions that
 * do so are replaced in the programs that are built with the source of this class.
 */
class FileCalls
{
public:
    /// Begins to watch; one object at a time, on the thread that makes it.
    FileCalls();
    ~FileCalls();
    FileCalls(const FileCalls &) = delete;
    FileCalls &operator=(const FileCalls &) = delete;

    /// What was looked at so far, "function path" each.
    QList<QByteArray> all() const;
};
