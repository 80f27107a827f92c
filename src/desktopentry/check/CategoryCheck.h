// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "CheckedEntry.h"

/// Checks of the categories of an application.
namespace CategoryCheck {

void check(const CheckedValue &value);

} // namespace CategoryCheck
