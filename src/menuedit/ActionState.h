// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

/**
 * What the user can do, computed from what is selected; knows no widget.
 */
struct ActionState
{
    /// What the state depends on.
    struct Selection
    {
        bool any = false; ///< whether something is selected
        bool writable = false; ///< whether the folder of the item may be written
        bool filesOnClipboard = false; ///< whether the clipboard holds files
        int row = 0; ///< the place of the item among its siblings as shown
        int count = 0; ///< the number of siblings shown, the item included
        bool isByTime = false; ///< whether the siblings are ordered by time, not by the user
    };

    bool create = true;
    bool edit = false; ///< also Delete, Execute, Cut and Copy
    bool paste = false;
    bool up = false;
    bool down = false;

    /// The state for \a selection.
    static ActionState of(const Selection &selection);
};
