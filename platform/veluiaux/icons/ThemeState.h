// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QtGlobal>

/// Tells when what was looked up in the icon theme is out of date.
namespace ThemeState {

/// A number that is another one after the theme or its search paths changed. Cheap.
quint64 generation();

/// Makes Qt read the theme's folders again, and generation() another number.
void reload();

} // namespace ThemeState
