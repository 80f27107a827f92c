// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "EditorCommand.h"

/// The commands that change, select, find and delete text, and those that move the cursor.
QVector<EditorCommand> editCommands();
