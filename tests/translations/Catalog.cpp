// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "Catalog.h"

#include <QFile>
#include <QXmlStreamReader>

namespace {

QString escaped(QString text)
{
    return text.replace(QLatin1Char('\\'), QLatin1String("\\\\"))
        .replace(QLatin1Char('\n'), QLatin1String("\\n"));
}

Message readMessage(QXmlStreamReader *xml, const QString &context)
{
    Message message;
    message.context = context;
    while (xml->readNextStartElement()) {
        if (xml->name() == QLatin1String("translation"))
            message.type = xml->attributes().value(QLatin1String("type")).toString();
        QString *text = xml->name() == QLatin1String("source") ? &message.source
            : xml->name() == QLatin1String("comment")          ? &message.comment
            : xml->name() == QLatin1String("translation")      ? &message.translation
                                                               : nullptr;
        if (text)
            *text = xml->readElementText();
        else
            xml->skipCurrentElement();
    }
    return message;
}

void readContext(QXmlStreamReader *xml, QVector<Message> *messages)
{
    QString context;
    while (xml->readNextStartElement()) {
        if (xml->name() == QLatin1String("name"))
            context = xml->readElementText();
        else if (xml->name() == QLatin1String("message"))
            messages->append(readMessage(xml, context));
        else
            xml->skipCurrentElement();
    }
}

} // namespace

QString Message::line() const
{
    QString line = context + QLatin1Char('\t') + escaped(source);
    if (!comment.isEmpty())
        line += QLatin1Char('\t') + escaped(comment);
    return line;
}

Catalog Catalog::read(const QString &path)
{
    Catalog catalog;
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly)) {
        catalog.error = path + QLatin1String(": ") + file.errorString();
        return catalog;
    }
    QXmlStreamReader xml(&file);
    if (xml.readNextStartElement() && xml.name() == QLatin1String("TS")) {
        catalog.language = xml.attributes().value(QLatin1String("language")).toString();
        while (xml.readNextStartElement()) {
            if (xml.name() == QLatin1String("context"))
                readContext(&xml, &catalog.messages);
            else
                xml.skipCurrentElement();
        }
    }
    if (xml.hasError())
        catalog.error = path + QLatin1String(": ") + xml.errorString();
    return catalog;
}

QStringList Catalog::lines() const
{
    QStringList lines;
    for (const Message &message : messages)
        lines.append(message.line());
    lines.sort();
    return lines;
}
