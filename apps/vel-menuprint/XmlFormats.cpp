// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuFormat.h"

#include "MenuTree.h"
#include "OpenCommand.h"

#include <support/TerminalText.h>

#include <QXmlStreamWriter>

namespace {

// XML has no way to write some characters, and one of them would cost the whole menu.
QString writable(QString text)
{
    const QString allowed = QStringLiteral("\t\n\r");
    for (QChar &c : text) {
        if ((c < QLatin1Char(' ') && !allowed.contains(c)) || c == QChar(0xfffe) || c == QChar(0xffff))
            c = QChar::ReplacementCharacter;
    }
    return text;
}

// What shows a name has one line.
QString label(const QString &name)
{
    return writable(TerminalText::onOneLine(name));
}

// In a label of Openbox an underscore marks the letter to press; two of them are one to show.
QString labelWithoutMark(const QString &name)
{
    return label(name).replace(QLatin1Char('_'), QStringLiteral("__"));
}

void writeIcon(QXmlStreamWriter *xml, const MenuItem &item)
{
    if (item.icon.startsWith(QLatin1Char('/')))
        xml->writeAttribute(QStringLiteral("icon"), writable(item.icon));
}

// What a name becomes as a label of a pipe menu.
using LabelOf = QString (*)(const QString &name);

void writePipeMenu(QXmlStreamWriter *xml, const QVector<MenuItem> &items, LabelOf labelOf)
{
    for (const MenuItem &item : items) {
        if (item.kind == MenuItem::Separator) {
            xml->writeEmptyElement(QStringLiteral("separator"));
            continue;
        }
        const bool isFolder = item.kind == MenuItem::Folder;
        xml->writeStartElement(isFolder ? QStringLiteral("menu") : QStringLiteral("item"));
        if (isFolder)
            xml->writeAttribute(QStringLiteral("id"), writable(item.path)); // unique, as Openbox asks for
        xml->writeAttribute(QStringLiteral("label"), labelOf(item.name));
        writeIcon(xml, item);
        if (isFolder) {
            writePipeMenu(xml, item.children, labelOf);
        } else {
            xml->writeStartElement(QStringLiteral("action"));
            xml->writeAttribute(QStringLiteral("name"), QStringLiteral("Execute"));
            xml->writeTextElement(QStringLiteral("command"), writable(OpenCommand::of(item.path)));
            xml->writeEndElement();
        }
        xml->writeEndElement();
    }
}

void writeJwm(QXmlStreamWriter *xml, const QVector<MenuItem> &items)
{
    for (const MenuItem &item : items) {
        if (item.kind == MenuItem::Separator) {
            xml->writeEmptyElement(QStringLiteral("Separator"));
            continue;
        }
        const bool isFolder = item.kind == MenuItem::Folder;
        xml->writeStartElement(isFolder ? QStringLiteral("Menu") : QStringLiteral("Program"));
        xml->writeAttribute(QStringLiteral("label"), label(item.name));
        writeIcon(xml, item);
        if (isFolder)
            writeJwm(xml, item.children);
        else
            xml->writeCharacters(writable(OpenCommand::of(item.path)));
        xml->writeEndElement();
    }
}

template <typename Write>
QByteArray document(const QString &root, Write write)
{
    QByteArray out;
    QXmlStreamWriter xml(&out);
    xml.setAutoFormatting(true);
    xml.writeStartDocument();
    xml.writeStartElement(root);
    write(&xml);
    xml.writeEndElement();
    xml.writeEndDocument();
    return out;
}

QByteArray pipeMenu(const MenuItem &menu, LabelOf labelOf)
{
    return document(QStringLiteral("openbox_pipe_menu"),
                    [&menu, labelOf](QXmlStreamWriter *xml) { writePipeMenu(xml, menu.children, labelOf); });
}

} // namespace

QByteArray MenuFormat::openbox(const MenuItem &menu)
{
    return pipeMenu(menu, labelWithoutMark);
}

QByteArray MenuFormat::labwc(const MenuItem &menu)
{
    return pipeMenu(menu, label);
}

QByteArray MenuFormat::openboxText(const QString &text)
{
    return document(QStringLiteral("openbox_pipe_menu"), [&text](QXmlStreamWriter *xml) {
        xml->writeEmptyElement(QStringLiteral("separator"));
        xml->writeAttribute(QStringLiteral("label"), label(text));
    });
}

QByteArray MenuFormat::jwm(const MenuItem &menu)
{
    return document(QStringLiteral("JWM"), [&menu](QXmlStreamWriter *xml) { writeJwm(xml, menu.children); });
}

QByteArray MenuFormat::jwmText(const QString &text)
{
    return document(QStringLiteral("JWM"), [&text](QXmlStreamWriter *xml) {
        xml->writeStartElement(QStringLiteral("Program"));
        xml->writeAttribute(QStringLiteral("label"), label(text));
        xml->writeCharacters(QStringLiteral("true"));
        xml->writeEndElement();
    });
}
