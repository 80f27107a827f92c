// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

/// Why an entry is not to be displayed: the codes that VelUIDesktopEntry::isDisplayable() gives.
/// Where several apply it gives the first of them.
namespace Undisplayable {

constexpr int Hidden = 1; ///< `Hidden=true`: the entry counts as deleted
constexpr int NoDisplay = 2; ///< `NoDisplay=true`: it works but stands in no menu
constexpr int ForOtherDesktops = 3; ///< `OnlyShowIn` or `NotShowIn` shuts it out here
constexpr int NotInstalled = 4; ///< what `TryExec` names cannot be found

} // namespace Undisplayable
