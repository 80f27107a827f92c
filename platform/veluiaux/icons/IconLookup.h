// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QIcon>
#include <QString>

/// Finds icons by the names that desktop entries use.
namespace IconLookup {

/// The icon \a name: a theme name, one with the suffix of an image file, or an absolute path.
/// Null when there is none.
QIcon find(const QString &name);

/// A text that is another one when \a name means another icon, as long as the theme stays.
QString identity(const QString &name);

} // namespace IconLookup
