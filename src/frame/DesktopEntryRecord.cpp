// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// Compiled for its checks alone: they hold whether or not anything else includes the header.
#include "DesktopEntryRecord.h"
