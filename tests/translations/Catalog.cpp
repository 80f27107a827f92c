// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "Catalog.h"

#include <QFile>
#include <QXmlStreamReader>

#include <iterator>

namespace {

QString escaped(QString text)
{
    return text.replace(QLatin1Char('\\'), QLatin1String("\\\\"))
        .replace(QLatin1Char('\n'), QLatin1String("\\n"));
}

// Numbers that take the first, second and third form in all languages that have so many.
constexpr int Numbers[] = {1, 2, 5};

QStringList readForms(QXmlStreamReader *xml)
{
    QStringList forms;
    while (xml->readNextStartElement())
        forms.append(xml->readElementText());
    return forms;
}

QVector<Message> formsOf(Message message, const QStringList &forms)
{
    QVector<Message> messages;
    for (int i = 0; i < forms.size() && i < int(std::size(Numbers)); ++i) {
        message.translation = forms.at(i);
        message.number = Numbers[i];
        messages.append(message);
    }
    return messages;
}

QVector<Message> readMessage(QXmlStreamReader *xml, const QString &context)
{
    const bool hasNumber = xml->attributes().hasAttribute(QLatin1String("numerus"));
    QStringList forms;
    Message message;
    message.context = context;
    while (xml->readNextStartElement()) {
        if (xml->name() == QLatin1String("translation"))
            message.type = xml->attributes().value(QLatin1String("type")).toString();
        if (hasNumber && xml->name() == QLatin1String("translation")) {
            forms = readForms(xml);
            continue;
        }
        QString *text = xml->name() == QLatin1String("source") ? &message.source
            : xml->name() == QLatin1String("comment")          ? &message.comment
            : xml->name() == QLatin1String("translation")      ? &message.translation
                                                               : nullptr;
        if (text)
            *text = xml->readElementText();
        else
            xml->skipCurrentElement();
    }
    return hasNumber ? formsOf(message, forms) : QVector<Message>{message};
}

void readContext(QXmlStreamReader *xml, QVector<Message> *messages)
{
    QString context;
    while (xml->readNextStartElement()) {
        if (xml->name() == QLatin1String("name"))
            context = xml->readElementText();
        else if (xml->name() == QLatin1String("message"))
            *messages += readMessage(xml, context);
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
    lines.removeDuplicates();
    lines.sort();
    return lines;
}
