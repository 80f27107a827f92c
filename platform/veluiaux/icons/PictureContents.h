// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "PictureLimits.h"

#include <QByteArray>

class QImageReader;

/// Judges the contents of pictures that are no drawings without decoding them.
namespace PictureContents {

/// Whether what the reader of a \a format tells of sizes is not to be relied on.
bool isAmbiguous(const QByteArray &format);

/// Adds all pictures in \a bytes of an ambiguous \a format to \a sum; whether they fit.
bool fits(const QByteArray &bytes, const QByteArray &format, PictureLimits::Sum *sum);

/// Adds all pictures that \a reader would read to \a sum; whether they fit.
bool fits(QImageReader *reader, PictureLimits::Sum *sum);

} // namespace PictureContents
