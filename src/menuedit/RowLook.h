// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "EntryState.h"

#include <QString>
#include <QVariant>

/**
 * How an assisted row tells more than its name. Gray stands for what the menu does not show or is about
 * to lose, slanted for what has no name of its own; both are explained.
 */
namespace RowLook {

/// What a row stands for.
struct Item
{
    QString path;
    EntryState::Kind state;
    bool isCut;
};

/// Whether \a role is one that data() answers for.
bool isOf(int role);

/// The color, the font, the tool tip or the description of the \a item; invalid where it is like any other.
QVariant data(const Item &item, int role);

} // namespace RowLook
