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
        int items = 1; ///< how many are selected
        int lastRow = -1; ///< of several siblings the place of the last one; row is that of the first
        bool areSiblings = true; ///< whether all of them are in one folder
        bool isAnyLocked = false; ///< whether one of several is in a folder that may not be written
    };

    bool create = true;
    bool edit = false; ///< also Execute: what is done to one item
    bool remove = false; ///< also Cut and Copy: what is done to all that are selected
    bool paste = false;
    bool up = false;
    bool down = false;

    /// The state for \a selection.
    static ActionState of(const Selection &selection);
};
