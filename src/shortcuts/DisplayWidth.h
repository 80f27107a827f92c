// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

class QString;

namespace DisplayWidth {

/**
 * How many columns a text takes in a font of fixed width.
 *
 * Wide characters, such as those of Chinese, Japanese and Korean, take two; marks that stand on
 * another character and invisible ones take none.
 */
int of(const QString &text);

} // namespace DisplayWidth
