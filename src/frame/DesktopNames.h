// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QStringList>

/// The desktop environments that OnlyShowIn and NotShowIn may name.
namespace DesktopNames {

/// Those that are registered with freedesktop.org, as public checkers of entries know them; in
/// alphabetical order.
QStringList registered();

/// Those that the session of this user says it is.
QStringList ofSession();

} // namespace DesktopNames
