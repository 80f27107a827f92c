// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <optional>

/**
 * What Qt's keys and modifiers are in X11's symbols and masks.
 *
 * Which modifier a mask stands for is the X server's word. Off X11, where KKeyServer must not be asked, it is
 * what it is on almost all of them.
 */
namespace KeySymbols {

/// A key as X11 has it.
struct Symbol
{
    int symbol = 0; ///< 0 for none
    unsigned int mask = 0; ///< of the modifiers
};

/// The symbol and the mask of the Qt key \a code, which has modifiers; nothing when X11 has no such key.
std::optional<Symbol> ofKey(int code);

/// The Qt key of \a symbol, without modifiers but Qt::KeypadModifier; nothing when Qt has no such key.
std::optional<int> keyOf(unsigned int symbol);

/// The Qt modifiers of an X11 modifier mask.
int modifiersOf(unsigned int mask);

} // namespace KeySymbols
