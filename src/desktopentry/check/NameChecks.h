// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "CheckedEntry.h"

/// Checks of the texts that a menu shows.
namespace NameChecks {

void check(const CheckedEntry &entry, EntryFindings *findings);

} // namespace NameChecks
