// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "Gzip.h"

#include <QtGlobal>

#include <zlib.h>

namespace {

constexpr int BlockSize = 65536;
constexpr int GzipHeader = 16; // added to the window bits, it has zlib expect one

} // namespace

bool Gzip::isCompressed(const QByteArray &bytes)
{
    return bytes.startsWith("\x1f\x8b");
}

std::optional<QByteArray> Gzip::decompressed(const QByteArray &bytes, int limit)
{
    z_stream stream = {};
    if (inflateInit2(&stream, MAX_WBITS + GzipHeader) != Z_OK)
        return std::nullopt;
    QByteArray input = bytes; // zlib asks for bytes that may change
    stream.next_in = reinterpret_cast<Bytef *>(input.data());
    stream.avail_in = uInt(input.size());
    QByteArray result;
    for (int status = Z_OK; status == Z_OK && result.size() <= limit;) {
        QByteArray block(BlockSize, Qt::Uninitialized);
        stream.next_out = reinterpret_cast<Bytef *>(block.data());
        stream.avail_out = BlockSize;
        status = inflate(&stream, Z_NO_FLUSH);
        result.append(block.constData(), BlockSize - int(stream.avail_out));
        // Another part may follow, and counts.
        if (status == Z_STREAM_END && stream.avail_in > 0)
            status = inflateReset(&stream);
    }
    inflateEnd(&stream);
    if (result.size() > limit)
        return std::nullopt;
    return result;
}
