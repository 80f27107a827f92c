// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "PictureLimits.h"

#include <QByteArray>

/// Judges the contents of a GIF file, whose reader tells other sizes than it makes pictures of.
namespace GifContents {

/// Adds all pictures in \a bytes to \a sum; whether they fit.
bool fits(const QByteArray &bytes, PictureLimits::Sum *sum);

} // namespace GifContents
