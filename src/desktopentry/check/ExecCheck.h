// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "CheckedEntry.h"

/// Checks of the commands: Exec and TryExec.
namespace ExecCheck {

/// Quoting, field codes and the program of an Exec \a value.
void checkExec(const CheckedEntry &entry, const CheckedValue &value);
/// The program of a TryExec \a value.
void checkTryExec(const CheckedEntry &entry, const CheckedValue &value);

} // namespace ExecCheck
