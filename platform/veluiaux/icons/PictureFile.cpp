// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "PictureFile.h"

#include "DrawingContents.h"
#include "Gzip.h"
#include "PictureContents.h"
#include "PictureLimits.h"

#include <QFile>
#include <QFileInfo>
#include <QGuiApplication>
#include <QImageReader>
#include <QtEndian>

namespace {

constexpr int PngBegin = 24; // bytes, with the size

std::optional<QByteArray> contents(const QString &path)
{
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly))
        return QByteArray(); // whoever reads it next tells
    // As much memory is taken as is asked for; what has no size yet may have contents.
    const qint64 expected = file.size() > 0 ? file.size() : qint64(PictureLimits::Bytes);
    const QByteArray bytes = file.read(qMin(expected, qint64(PictureLimits::Bytes)) + 1);
    if (bytes.size() > PictureLimits::Bytes)
        return std::nullopt;
    return Gzip::isCompressed(bytes) ? Gzip::decompressed(bytes, PictureLimits::Bytes) : bytes;
}

// By its name, by its contents, or, as far as the reader of pictures knows nothing, perhaps.
bool isDrawing(const QString &path, const QByteArray &format)
{
    const QString suffix = QFileInfo(path).suffix().toLower();
    return suffix == QLatin1String("svg") || suffix == QLatin1String("svgz") || suffix == QLatin1String("gz")
        || format.startsWith("svg") || format.isEmpty();
}

// A drawing is read whole, with all pictures in it, before its size is known.
bool isSafeDrawing(const QString &path, QImageReader *reader)
{
    const std::optional<QByteArray> bytes = contents(path);
    return bytes && DrawingContents::isSafe(*bytes)
        && (reader->format().isEmpty() || PictureLimits::fits(reader->size()));
}

bool isSafeFile(const QString &path)
{
    QImageReader reader(path);
    const QByteArray format = reader.format();
    if (isDrawing(path, format))
        return isSafeDrawing(path, &reader);
    PictureLimits::Sum sum;
    if (!PictureContents::isAmbiguous(format))
        return PictureContents::fits(&reader, &sum);
    const std::optional<QByteArray> bytes = contents(path);
    return bytes && PictureContents::fits(*bytes, format, &sum);
}

// The size of a PNG picture stands at its begin.
std::optional<QSize> sizeOfPng(const QByteArray &begin)
{
    static const QByteArray mark("\x89PNG\r\n\x1a\n\0\0\0\rIHDR", 16);
    if (begin.size() < PngBegin || !begin.startsWith(mark))
        return std::nullopt;
    const quint32 width = qFromBigEndian<quint32>(begin.constData() + mark.size());
    const quint32 height = qFromBigEndian<quint32>(begin.constData() + mark.size() + 4);
    constexpr quint32 Most = PictureLimits::Edge + 1;
    return QSize(int(qMin(width, Most)), int(qMin(height, Most)));
}

bool isSafePicture(const QString &path)
{
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly))
        return true; // whoever reads it next tells
    const auto size = sizeOfPng(file.read(PngBegin));
    return size ? PictureLimits::fits(*size) : isSafeFile(path);
}

// As Qt names the variant of a file for \a ratio.
QString variant(const QString &path, int ratio)
{
    int place = path.lastIndexOf(QLatin1Char('.'));
    if (place < 0)
        place = path.size();
    else if (QStringView(path).left(place).endsWith(QLatin1String(".9")))
        place -= 2;
    return QString(path).insert(place, QStringLiteral("@%1x").arg(ratio));
}

bool areVariantsSafe(const QString &path)
{
    if (qGuiApp->devicePixelRatio() <= 1)
        return true;
    for (int ratio = 2; ratio <= 9; ++ratio) {
        const QFileInfo file(variant(path, ratio));
        if (file.exists() && (!file.isFile() || !isSafeFile(file.filePath())))
            return false;
    }
    return true;
}

} // namespace

bool PictureFile::isSafe(const QString &path)
{
    return isSafeFile(path) && areVariantsSafe(path);
}

bool PictureFile::isSafeOfTheme(const QString &path)
{
    // Opening a pipe would wait for whoever writes into it.
    if (!QFileInfo(path).isFile())
        return false;
    if (path.endsWith(QLatin1String(".png")))
        return isSafePicture(path) && areVariantsSafe(path);
    return path.endsWith(QLatin1String(".svg")) ? readSafeDrawing(path) && areVariantsSafe(path)
                                                : isSafe(path);
}

std::optional<QByteArray> PictureFile::readSafeDrawing(const QString &path)
{
    if (!QFileInfo(path).isFile())
        return std::nullopt;
    const std::optional<QByteArray> bytes = contents(path);
    return bytes && DrawingContents::isSafe(*bytes) ? bytes : std::nullopt;
}
