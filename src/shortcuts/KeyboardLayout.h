// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

namespace KeyboardLayout {

/**
 * Whether the keyboard layout that the X server uses now can produce a chord.
 *
 * Letters of the Latin script may come from any layout that the user can switch to: Qt looks there
 * for them by itself. Any other character has to be in the one that is switched on.
 *
 * @param chord a Qt::Key or-ed with Qt::KeyboardModifier bits
 * @return true, too, where that is not known: without X11, and for keys that X11 does not have
 */
bool produces(int chord);

} // namespace KeyboardLayout
