// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// A function that only the later build exports; the host asks for it to know which one it runs with.

#include "veluiextra_export.h"

extern "C" VELUIEXTRA_EXPORT const char *velAddedInTheNextBuild();

const char *velAddedInTheNextBuild()
{
    return "1.1";
}
