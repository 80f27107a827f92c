// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "FileProgress.h"
#include "TreeCopy.h"
#include "TreeState.h"

#include <QString>

#include <memory>
#include <system_error>

class StagingFolder;

/**
 * A file, link or folder that was taken from its place and can be brought back as it was.
 */
class KeptThing
{
public:
    /// Puts what is at \a path into the desktop's trash; null where none can be had.
    static std::unique_ptr<KeptThing> inTrash(const QString &path);
    /// Puts what is at \a path into a hidden folder beside it, which goes with this object; null
    /// where that fails.
    static std::unique_ptr<KeptThing> beside(const QString &path);
    ~KeptThing();
    KeptThing(const KeptThing &) = delete;
    KeptThing &operator=(const KeptThing &) = delete;

    /// Whether it is still there; somebody may have emptied the trash.
    bool isThere() const;
    /// How it was when it was put away.
    const TreeState &state() const { return m_state; }
    /// Moves it to \a path; nothing is overwritten.
    std::error_code bringBack(const QString &path, FileProgress &progress);

private:
    explicit KeptThing(const QString &path);

    TreeState m_state;
    TreeCopy::Path m_place;
    QString m_inTrash; // the same as text; empty where it is not in a trash
    FileProgress m_nobody; // follows what becomes of the folder
    std::unique_ptr<StagingFolder> m_folder;
};
