// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "CheckedEntry.h"

/// Checks of the values of single keys.
namespace ValueChecks {

/// Characters that values of its kind cannot have, and what is neither true nor false; false when there
/// is no sense in looking closer.
bool checkKind(const CheckedValue &value);

void checkType(const CheckedValue &value);
void checkVersion(const CheckedValue &value);
void checkEncoding(const CheckedValue &value);
void checkIcon(const CheckedEntry &entry, const CheckedValue &value);
void checkPath(const CheckedEntry &entry, const CheckedValue &value);
void checkUrl(const CheckedEntry &entry, const CheckedValue &value);
/// Whether D-Bus can start a program by the name of the entry's file.
void checkBusActivation(const CheckedEntry &entry, const CheckedValue &value);

} // namespace ValueChecks
