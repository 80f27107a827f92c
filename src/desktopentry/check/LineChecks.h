// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "CheckedEntry.h"

/// Checks of what no value shows: the file's name, its lines and groups.
namespace LineChecks {

void check(const CheckedEntry &entry, EntryFindings *findings);

} // namespace LineChecks
