// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <velcore/velcore_export.h>

#include <string>

namespace Vel {

/**
 * Keeps other programs of the desktop from replacing a file of a folder while this one does.
 *
 * It is a lock on the folder itself, which leaves nothing behind, also when its holder is killed.
 * Take it for the moment between a last look at the old file and the renaming of the new one, never
 * for reading. Who holds a lock must not stop others for good: they go on without when nothing in the
 * folder has changed for a second. A queue of writers that get on is waited for, ten seconds at most.
 *
 * Different objects may be used in different threads; one object may not.
 *
 * \since 1.0
 */
class VELCORE_EXPORT FolderLock
{
public:
    /// Waits for the lock on \a folder, as said above; no text is the current folder.
    explicit FolderLock(const std::string &folder);
    /// Releases the lock.
    ~FolderLock();
    FolderLock(const FolderLock &) = delete;
    FolderLock &operator=(const FolderLock &) = delete;

    /// Whether the lock was got; it was not when others held it for too long, when the folder may
    /// not be read, and where the file system knows no locks.
    bool isHeld() const { return m_isHeld; }

private:
    int m_folder;
    bool m_isHeld;
};

/**
 * Takes that lock on a folder that is open for reading already, for as long as it stays open.
 *
 * @return what FolderLock::isHeld() tells
 */
VELCORE_EXPORT bool lockFolder(int folder);

} // namespace Vel
