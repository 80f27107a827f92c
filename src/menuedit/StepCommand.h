// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "FileStep.h"
#include "StepText.h"

#include <QStringList>
#include <QUndoCommand>

/**
 * A step of the history as the stack keeps it. It goes to and fro beforehand, as it may be refused, which
 * a command cannot be.
 */
class StepCommand : public QUndoCommand
{
public:
    StepCommand(FileStep step, const StepText &text, const QStringList &items);
    ~StepCommand() override;

    void undo() override { setObsolete(m_isGivenUp); }
    void redo() override { setObsolete(m_isGivenUp); }

    FileStep &step() const { return m_step; }
    const StepText &text() const { return m_text; }
    const QStringList &items() const { return m_items; }
    /// Has the stack drop it when it goes over it next.
    void giveUp() const { m_isGivenUp = true; }

private:
    // The stack hands out constant commands, and what becomes of the disk is no change of it.
    mutable FileStep m_step;
    mutable bool m_isGivenUp = false;
    const StepText m_text;
    const QStringList m_items;
};
