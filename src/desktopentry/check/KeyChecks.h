// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "CheckedEntry.h"

/// Checks of which keys there are, whatever their values are.
namespace KeyChecks {

/// Names, repetitions and languages of the keys of any \a group; true for \a key when its value can be
/// looked at.
bool checkKey(const CheckedEntry &entry, const CheckedValue &value);
/// The keys that \a group has to have, and those that exclude each other.
void checkGroup(const EntryText::Group &group, EntryFindings *findings);

/// Whether \a group is of the entry itself or of an action: a group with keys of the standard.
bool isOfStandard(const EntryText::Group &group);

} // namespace KeyChecks
