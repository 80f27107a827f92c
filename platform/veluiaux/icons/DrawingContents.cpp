// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "DrawingContents.h"

#include "PictureContents.h"
#include "PictureLimits.h"

#include <QBuffer>
#include <QImageReader>
#include <QXmlStreamReader>

#include <cstring>

namespace {

// Without regard to namespaces, as the reader of drawings has it.
bool isNamed(QStringView qualifiedName, QLatin1String name)
{
    return qualifiedName == name
        || (qualifiedName.endsWith(name) && qualifiedName.chopped(name.size()).endsWith(QLatin1Char(':')));
}

bool isSafePicture(const QByteArray &bytes, PictureLimits::Sum *sum)
{
    QBuffer buffer;
    buffer.setData(bytes);
    buffer.open(QIODevice::ReadOnly);
    QImageReader reader(&buffer);
    const QByteArray format = reader.format();
    // A drawing in a drawing would have to be judged in turn, and so on.
    if (format.startsWith("svg"))
        return false;
    return PictureContents::isAmbiguous(format) ? PictureContents::fits(bytes, format, sum)
                                                : PictureContents::fits(&reader, sum);
}

// What stands in the drawing itself; everything else would be looked for as a file.
bool isSafeReference(const QString &reference, PictureLimits::Sum *sum)
{
    const QString text = reference.trimmed();
    if (text.isEmpty())
        return true;
    const QLatin1String mark("base64,");
    const int place = text.lastIndexOf(mark);
    if (!text.startsWith(QLatin1String("data")) || place < 0)
        return false;
    return isSafePicture(QByteArray::fromBase64(text.mid(place + mark.size()).toLatin1()), sum);
}

bool isSafeElement(const QXmlStreamReader &xml, PictureLimits::Sum *sum)
{
    if (!isNamed(xml.qualifiedName(), QLatin1String("image")))
        return true;
    for (const QXmlStreamAttribute &attribute : xml.attributes()) {
        const QString name = attribute.qualifiedName().toString();
        if (isNamed(name, QLatin1String("href")) && !isSafeReference(attribute.value().toString(), sum))
            return false;
    }
    return true;
}

// Plain text without the words for pictures, other files and entities, which is nearly every drawing.
bool isPlainlySafe(const QByteArray &bytes)
{
    if (bytes.contains('\0') || bytes.contains("image") || bytes.contains("xml-stylesheet")
        || bytes.contains("<!DOCTYPE"))
        return false;
    // In another encoding the words may look otherwise.
    const int declaration = bytes.indexOf("encoding");
    const QByteArray encoding = bytes.mid(declaration, int(std::strlen("encoding=\"UTF-8\""))).toLower();
    return declaration < 0 || encoding == "encoding=\"utf-8\"" || encoding == "encoding='utf-8'";
}

} // namespace

bool DrawingContents::isSafe(const QByteArray &bytes)
{
    if (isPlainlySafe(bytes))
        return true;
    QXmlStreamReader xml(bytes);
    xml.setNamespaceProcessing(false);
    PictureLimits::Sum sum;
    // What is read before an error counts: the reader of drawings has read it by then, too.
    while (!xml.atEnd()) {
        const QXmlStreamReader::TokenType token = xml.readNext();
        if (token == QXmlStreamReader::StartElement && !isSafeElement(xml, &sum))
            return false;
        // A style sheet is another file.
        if (token == QXmlStreamReader::ProcessingInstruction
            && xml.processingInstructionTarget() == QLatin1String("xml-stylesheet"))
            return false;
    }
    return true;
}
