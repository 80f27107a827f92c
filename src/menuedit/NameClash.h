// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>

/**
 * A file that is to come to a folder where its name is taken, to be decided by the user.
 */
struct NameClash
{
    enum class Choice {
        KeepBoth, ///< It gets another file name.
        Replace, ///< It takes the place of what is there.
        Skip, ///< It stays where it is.
        Cancel ///< So do all that came with it.
    };

    struct Answer
    {
        Choice choice = Choice::Cancel;
        /// Whether the choice is good for all clashes that follow.
        bool isForAll = false;
    };

    enum class Kind {
        IsThere, ///< Something has the name.
        HoldsThem, ///< A folder has it that something of what comes lies in.
        IsPromised ///< Another one of those that come gets it.
    };

    QString source; ///< the path of the file
    QString target; ///< the path that is taken
    Kind kind = Kind::IsThere;
    /// Whether others may follow.
    bool isOneOfSeveral = false;

    bool isReplaceable() const { return kind == Kind::IsThere; }
};
