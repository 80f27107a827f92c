// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "CheckedEntry.h"

/// Checks of the lists of an entry.
namespace ListChecks {

void checkDesktops(const CheckedValue &value);
void checkMimeTypes(const CheckedEntry &entry, const CheckedValue &value);
void checkInterfaces(const CheckedValue &value);
void checkActions(const CheckedEntry &entry, const CheckedValue &value);

} // namespace ListChecks
