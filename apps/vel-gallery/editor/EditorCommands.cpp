// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EditorCommands.h"

#include "EditCommands.h"
#include "FileCommands.h"
#include "TextCommands.h"
#include "ViewCommands.h"

QVector<EditorCommand> editorCommands()
{
    return fileCommands() + editCommands() + textCommands() + viewCommands();
}
