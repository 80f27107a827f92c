// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "StepRecorder.h"

#include "ContentsChange.h"
#include "KeptThing.h"
#include "MoveChange.h"
#include "OnDisk.h"
#include "PresenceChange.h"

StepRecorder::StepRecorder() = default;
StepRecorder::~StepRecorder() = default;

void StepRecorder::mayWrite(const QString &path)
{
    m_writes.push_back(std::make_unique<ContentsChange>(path));
}

void StepRecorder::mayMake(const QString &path)
{
    if (!OnDisk::exists(path))
        m_made.push_back(path);
}

void StepRecorder::mayMove(const QString &from, const QString &to)
{
    if (!OnDisk::exists(to))
        m_moves.push_back(std::make_unique<MoveChange>(from, to));
}

void StepRecorder::deleted(const QString &path, std::unique_ptr<KeptThing> kept)
{
    m_step.add(std::make_unique<PresenceChange>(path, std::move(kept)));
}

void StepRecorder::changed(std::unique_ptr<FileChange> change)
{
    m_step.add(std::move(change));
}

FileStep StepRecorder::finish()
{
    for (const QString &path : m_made) {
        if (OnDisk::exists(path))
            m_step.add(std::make_unique<PresenceChange>(path));
    }
    for (auto &move : m_moves) {
        if (move->hasHappened())
            m_step.add(std::move(move));
    }
    for (auto &write : m_writes) {
        if (write->hasHappened())
            m_step.add(std::move(write));
    }
    m_step.note();
    return std::move(m_step);
}
