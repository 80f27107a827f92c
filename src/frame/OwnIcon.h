// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

class QIcon;
class QString;

/// Icons of the library's own, for which a theme need not have a picture.
namespace OwnIcon {

/// The icon \a name of the theme; where that has none, the one that was installed with the library.
/// Null where there is none, either.
QIcon named(const QString &name);

} // namespace OwnIcon
