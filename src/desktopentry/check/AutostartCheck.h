// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "CheckedEntry.h"

/// Checks of what decides whether an entry is started with the session.
namespace AutostartCheck {

void check(const CheckedValue &value);

} // namespace AutostartCheck
