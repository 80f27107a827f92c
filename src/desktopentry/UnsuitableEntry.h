// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <frame/DesktopEntryRecord.h>

#include <QString>

/// Why an entry cannot be used, and what to do about it.
namespace UnsuitableEntry {

/// What is said to the user.
QString text(VelUIDesktopEntry::SuitableError error);
/// The key whose value makes \a entry unsuitable.
QString fieldMeant(VelUIDesktopEntry::SuitableError error, const VelUIDesktopEntry &entry);

} // namespace UnsuitableEntry
