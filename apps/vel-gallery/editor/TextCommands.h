// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "EditorCommand.h"

/// The commands that change words and whole lines.
QVector<EditorCommand> textCommands();
