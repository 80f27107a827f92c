// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "MenuTestCase.h"

/// The fixture of the tests that bring items from one place to another: "a" beside a folder of three.
class TransferTestCase : public MenuTestCase
{
    Q_OBJECT

public:
    using MenuTestCase::MenuTestCase;

protected Q_SLOTS:
    void init();
    void cleanup();

protected:
    /// The entry "a.desktop" of the menu.
    QString m_a;
    /// The folder "sub" with the entries "x", "y" and "z".
    QString m_sub;
};
