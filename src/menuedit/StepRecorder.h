// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "FileStep.h"

#include <QString>

#include <memory>
#include <vector>

class ContentsChange;
class KeptThing;
class MoveChange;

/**
 * Finds out what an operation changes: it is told before the operation what that may touch, and looks
 * afterwards what came of it.
 */
class StepRecorder
{
public:
    StepRecorder();
    ~StepRecorder();
    StepRecorder(const StepRecorder &) = delete;
    StepRecorder &operator=(const StepRecorder &) = delete;

    /// The small file at \a path may be written.
    void mayWrite(const QString &path);
    /// Something may come to be at \a path.
    void mayMake(const QString &path);
    /// What is at \a from may be moved to \a to.
    void mayMove(const QString &from, const QString &to);
    /// What was at \a path was put away as \a kept.
    void deleted(const QString &path, std::unique_ptr<KeptThing> kept);
    /// Something that is no matter of the others was changed.
    void changed(std::unique_ptr<FileChange> change);

    /// What has changed; empty where nothing has. To be called once.
    FileStep finish();

private:
    std::vector<std::unique_ptr<ContentsChange>> m_writes;
    std::vector<std::unique_ptr<MoveChange>> m_moves;
    std::vector<QString> m_made;
    FileStep m_step;
};
