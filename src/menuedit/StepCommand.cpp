// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "StepCommand.h"

StepCommand::StepCommand(FileStep step, const StepText &text, const QStringList &items)
    : m_step(std::move(step))
    , m_text(text)
    , m_items(items)
{
}

StepCommand::~StepCommand() = default;
