// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "Refusal.h"

#include <QStringList>

class FileProgress;

/**
 * One thing on disk that an operation of the user changed, and can be changed back.
 *
 * It begins as done. undo() and redo() take turns; each changes all or nothing and never
 * overwrites what it does not know.
 */
class FileChange
{
public:
    FileChange() = default;
    virtual ~FileChange();
    FileChange(const FileChange &) = delete;
    FileChange &operator=(const FileChange &) = delete;

    /// The places in which it puts or takes something.
    virtual QStringList paths() const = 0;
    /// Looks how the disk stands after the operation, after undo() or after redo().
    virtual void note() = 0;
    /// Whether the disk still stands as it was noted; why not.
    virtual Refusal check() const = 0;
    /// Changes it back; where that takes long, \a progress follows it, and may end it.
    virtual Refusal undo(FileProgress &progress) = 0;
    virtual Refusal redo(FileProgress &progress) = 0;
};
