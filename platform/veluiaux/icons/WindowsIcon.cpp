// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "WindowsIcon.h"

#include <QBuffer>
#include <QImageReader>
#include <QtEndian>

namespace {

constexpr int CountAt = 4;
constexpr int FirstEntryAt = 6;
constexpr int EntrySize = 16;
constexpr int OffsetAt = 12; // in an entry
constexpr int WidthAt = 4; // in the header of a bitmap
constexpr int HeightAt = 8;
constexpr int BitmapHeaderSize = 40;

template <typename Number>
Number numberAt(const QByteArray &bytes, int place)
{
    return qFromLittleEndian<Number>(bytes.constData() + place);
}

QSize sizeOfPng(const QByteArray &bytes)
{
    QBuffer buffer;
    buffer.setData(bytes);
    buffer.open(QIODevice::ReadOnly);
    return QImageReader(&buffer, "png").size();
}

// A bitmap is twice as high as it is shown: the mask follows the picture.
QSize sizeOfBitmap(const QByteArray &bytes)
{
    if (bytes.size() < BitmapHeaderSize)
        return QSize();
    const auto width = qint64(numberAt<qint32>(bytes, WidthAt));
    const auto height = qint64(numberAt<qint32>(bytes, HeightAt));
    const auto bounded = [](qint64 edge) { return int(qMin(qAbs(edge), qint64(PictureLimits::Edge) + 1)); };
    return QSize(bounded(width), bounded((qAbs(height) + 1) / 2));
}

} // namespace

bool WindowsIcon::fits(const QByteArray &bytes, PictureLimits::Sum *sum)
{
    const int count = bytes.size() < FirstEntryAt ? 0 : numberAt<quint16>(bytes, CountAt);
    for (int i = 0; i < count; ++i) {
        const int entry = FirstEntryAt + i * EntrySize;
        if (entry + EntrySize > bytes.size())
            return true; // nothing can be read there
        const auto offset = numberAt<quint32>(bytes, entry + OffsetAt);
        if (offset >= quint32(bytes.size()))
            continue;
        const QByteArray picture =
            QByteArray::fromRawData(bytes.constData() + offset, bytes.size() - int(offset));
        if (!sum->add(picture.startsWith("\x89PNG") ? sizeOfPng(picture) : sizeOfBitmap(picture)))
            return false;
    }
    return true;
}
