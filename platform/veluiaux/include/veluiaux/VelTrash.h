// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <veluiaux/veluiaux_export.h>

/**
 * The user's trash can.
 *
 * May be called from any thread, while none changes the environment.
 *
 * \since 1.0
 */
class VELUIAUX_EXPORT VelTrash
{
public:
    VelTrash() = delete;

    /**
     * Whether the trash of the home folder holds nothing.
     *
     * That is the folder Trash below $XDG_DATA_HOME, or below ~/.local/share where that is not
     * set; without $HOME the user data base knows the home. It is looked at anew in every call. A trash that does not exist or cannot be read
     * counts as empty.
     */
    static bool isEmpty();
};
