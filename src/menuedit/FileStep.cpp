// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FileStep.h"

#include "FileProgress.h"

FileStep::FileStep() = default;
FileStep::~FileStep() = default;
FileStep::FileStep(FileStep &&other) noexcept = default;
FileStep &FileStep::operator=(FileStep &&other) noexcept = default;

void FileStep::add(std::unique_ptr<FileChange> change)
{
    m_changes.push_back(std::move(change));
}

QStringList FileStep::paths() const
{
    QStringList paths;
    for (const auto &change : m_changes)
        paths += change->paths();
    paths.removeDuplicates();
    return paths;
}

void FileStep::note()
{
    for (const auto &change : m_changes)
        change->note();
}

Refusal FileStep::undo()
{
    FileProgress nobody;
    return undo(nobody);
}

Refusal FileStep::undo(FileProgress &progress)
{
    Changes changes;
    for (auto it = m_changes.rbegin(); it != m_changes.rend(); ++it)
        changes.push_back(it->get());
    return run(changes, &FileChange::undo, &FileChange::redo, progress);
}

Refusal FileStep::redo()
{
    FileProgress nobody;
    return redo(nobody);
}

Refusal FileStep::redo(FileProgress &progress)
{
    Changes changes;
    for (const auto &change : m_changes)
        changes.push_back(change.get());
    return run(changes, &FileChange::redo, &FileChange::undo, progress);
}

// A change is looked at when its turn comes, as it may need what another one brought back, and noted
// before the next: that is what it has to find when it goes the other way. What fails half way has all
// that was done before it taken back.
Refusal FileStep::run(const Changes &changes, Way there, Way back, FileProgress &progress)
{
    UnstoppableProgress unstoppable(progress);
    Refusal refusal;
    std::size_t done = 0;
    for (; done < changes.size(); ++done) {
        refusal = progress.goOn()
            ? changes[done]->check()
            : Refusal::failed(QString(), std::make_error_code(std::errc::operation_canceled));
        if (!refusal)
            refusal = (changes[done]->*there)(progress);
        if (refusal)
            break;
        changes[done]->note();
    }
    for (; refusal && done > 0; --done) {
        if ((changes[done - 1]->*back)(unstoppable))
            refusal.isForGood = true;
        changes[done - 1]->note();
    }
    return refusal;
}
