// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>

class VelUIDesktopEntry;

namespace EntryName {

/**
 * The name under which the menu shows \a entry: its name in the user's language as it
 * stands; without one, the untranslated name (empty or not) followed by a blank and the
 * generic name in the user's language where there is one. Empty when there is none of them.
 */
QString of(const VelUIDesktopEntry &entry);

} // namespace EntryName
