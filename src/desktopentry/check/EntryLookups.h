// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>

/// What a check of an entry asks about the computer it runs on.
///
/// Asking costs nothing: where the answer would take a look at the disk it is Unknown at first.
class EntryLookups
{
public:
    enum class Answer { Unknown, Yes, No };

    virtual ~EntryLookups() = default;

    /// Whether \a program can be run: a path, a relative one counting from \a folder, or a name to be
    /// found in PATH.
    virtual Answer program(const QString &program, const QString &folder) const = 0;
    /// Whether an icon theme has \a name, or a picture stands at that path.
    virtual Answer icon(const QString &name) const = 0;
    /// Whether there is a file or folder at \a path.
    virtual Answer file(const QString &path) const = 0;
    /// Whether the MIME database has \a name.
    virtual Answer mimeType(const QString &name) const = 0;
};
