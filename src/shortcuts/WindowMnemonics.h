// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QKeySequence>
#include <QString>
#include <QVector>

class QWidget;

/**
 * The keys by which the underlined letters of a window are reached.
 */
namespace WindowMnemonics {

/// What has an underlined letter.
struct Owner
{
    QString text; ///< its text, without the mark of the letter
    bool isMenu; ///< whether it stands in the menu bar
};

/**
 * Finds what a key leads to.
 *
 * @param window the window, or a part of it; what is hidden in it does not count
 * @param key one chord
 * @return the menus first
 */
QVector<Owner> ownersOf(const QWidget &window, const QKeySequence &key);

} // namespace WindowMnemonics
