// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "MenuTestCase.h"

class VelMenuView;

/// The fixture of the tests that search the tree.
class FindTestCase : public MenuTestCase
{
    Q_OBJECT

public:
    using MenuTestCase::MenuTestCase;

protected:
    /// Searches for \a text, no window opens but the question for it.
    void find(VelMenuView &view, const QString &text);
    /// Fills the menu with nine folders that hold nothing but links to each other: there are more
    /// ways through them than a search can go, which takes it more than half a second.
    void writeMaze();
};
