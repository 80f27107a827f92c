// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "GifContents.h"

#include <QtEndian>

namespace {

constexpr int HeaderSize = 13;
constexpr int ScreenAt = 6;
constexpr int FlagsAt = 10;
constexpr int FrameSize = 10; // with the byte that begins it
constexpr int FrameFlagsAt = 9;

int numberAt(const QByteArray &bytes, int place)
{
    return qFromLittleEndian<quint16>(bytes.constData() + place);
}

QSize sizeAt(const QByteArray &bytes, int place)
{
    return QSize(numberAt(bytes, place), numberAt(bytes, place + 2));
}

int colorTableSize(char flags)
{
    return (flags & 0x80) ? 3 << ((flags & 7) + 1) : 0;
}

// Behind the parts that begin at \a place, each with its length before it; the last is empty.
int behindParts(const QByteArray &bytes, int place)
{
    while (place < bytes.size() && bytes.at(place) != '\0')
        place += 1 + uchar(bytes.at(place));
    return place + 1;
}

} // namespace

bool GifContents::fits(const QByteArray &bytes, PictureLimits::Sum *sum)
{
    if (bytes.size() < HeaderSize)
        return true; // nothing can be read there
    const QSize screen = sizeAt(bytes, ScreenAt);
    int place = HeaderSize + colorTableSize(bytes.at(FlagsAt));
    while (place + FrameSize <= bytes.size()) {
        const char kind = bytes.at(place);
        if (kind == ',') {
            // What stands out of the screen may make it larger.
            const QSize offset = sizeAt(bytes, place + 1);
            if (!sum->add(screen.expandedTo(offset + sizeAt(bytes, place + 5))))
                return false;
            place += FrameSize + colorTableSize(bytes.at(place + FrameFlagsAt)) + 1;
        } else if (kind == '!') {
            place += 2;
        } else {
            return kind == ';' || sum->add(screen);
        }
        place = behindParts(bytes, place);
    }
    return true;
}
