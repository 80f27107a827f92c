// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QStringList>

/// The pixels of the icons of a theme, beside those of Qt.
namespace IconPixels {

/// The names of the icons below \a folder: all with VEL_TEST_FULL, else some from all over it.
QStringList namesIn(const QString &folder);

/// The first of the icons, with its size, that has not the pixels that Qt gives it in the theme that
/// is in use; empty if there is none.
QString firstDifference(const QStringList &names);

} // namespace IconPixels
