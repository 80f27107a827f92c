// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "FileChange.h"

#include <memory>
#include <vector>

/**
 * All that one operation of the user changed on disk: it is taken back, or done again, as a whole or not
 * at all.
 */
class FileStep
{
public:
    FileStep();
    ~FileStep();
    FileStep(FileStep &&other) noexcept;
    FileStep &operator=(FileStep &&other) noexcept;

    /// Adds what was changed next.
    void add(std::unique_ptr<FileChange> change);
    /// The places in which something comes or goes.
    QStringList paths() const;
    bool isEmpty() const { return m_changes.empty(); }
    /// Looks how the disk stands, when all changes are there.
    void note();

    /// Takes everything back, the last change first. Nothing is changed where the disk is not as it was
    /// left, or where any change cannot be taken back.
    Refusal undo(FileProgress &progress);
    Refusal undo();
    /// Does everything again.
    Refusal redo(FileProgress &progress);
    Refusal redo();

private:
    using Changes = std::vector<FileChange *>;

    using Way = Refusal (FileChange::*)(FileProgress &progress);

    Refusal run(const Changes &changes, Way there, Way back, FileProgress &progress);

    std::vector<std::unique_ptr<FileChange>> m_changes;
};
