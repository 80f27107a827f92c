// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "PictureLimits.h"

#include <QByteArray>

/// Judges the contents of an ICO or CUR file, whose directory may tell other sizes than its pictures.
namespace WindowsIcon {

/// Adds all pictures in \a bytes to \a sum; whether they fit.
bool fits(const QByteArray &bytes, PictureLimits::Sum *sum);

} // namespace WindowsIcon
