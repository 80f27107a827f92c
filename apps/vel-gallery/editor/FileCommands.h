// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "EditorCommand.h"

/// The commands that read and write files, and those that insert something.
QVector<EditorCommand> fileCommands();
