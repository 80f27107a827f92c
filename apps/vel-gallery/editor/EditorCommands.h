// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "EditorCommand.h"

/// All commands of the editor, in the order of the menus.
QVector<EditorCommand> editorCommands();
