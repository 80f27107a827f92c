// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

class EntryDocument;

/// The reasons why an entry cannot be used or is not to be shown.
namespace EntryChecks {

enum Unsuitable {
    Suitable = 0,
    NoExec = 1,
    ProgramMissing = 2,
    ProgramNotExecutable = 3,
    ProgramNotInPath = 4,
    TryExecMissing = 5,
    TryExecNotInPath = 6,
    UrlMissing = 7,
    Unusable = -1
};

enum NotDisplayed {
    Displayed = 0,
    IsHidden = 1,
    IsNotForMenus = 2,
    IsForOtherDesktops = 3,
    NotInstalled = 4
};

/// Why the entry cannot be used as it stands.
Unsuitable suitability(const EntryDocument &entry);
/// Why the entry is not to be shown in the running desktop's menus.
NotDisplayed displayability(const EntryDocument &entry);

} // namespace EntryChecks
