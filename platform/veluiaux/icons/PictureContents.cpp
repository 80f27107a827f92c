// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "PictureContents.h"

#include "GifContents.h"
#include "WindowsIcon.h"

#include <QImageReader>

bool PictureContents::isAmbiguous(const QByteArray &format)
{
    return format == "gif" || format == "ico" || format == "cur";
}

bool PictureContents::fits(const QByteArray &bytes, const QByteArray &format, PictureLimits::Sum *sum)
{
    return format == "gif" ? GifContents::fits(bytes, sum) : WindowsIcon::fits(bytes, sum);
}

bool PictureContents::fits(QImageReader *reader, PictureLimits::Sum *sum)
{
    const int count = qMax(1, reader->imageCount());
    if (reader->supportsAnimation())
        return sum->add(reader->size(), count);
    for (int i = 0; i < count; ++i) {
        if ((i > 0 && !reader->jumpToImage(i)) || !sum->add(reader->size()))
            return false;
    }
    return true;
}
