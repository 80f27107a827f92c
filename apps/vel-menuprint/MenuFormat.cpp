// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuFormat.h"

#include "MenuTree.h"

#include <support/TerminalText.h>

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QXmlStreamWriter>

namespace {

// One word of a shell's command line, whatever it holds.
QString quoted(const QString &word)
{
    return QLatin1Char('\'') + QString(word).replace(QLatin1Char('\''), QStringLiteral("'\\''"))
        + QLatin1Char('\'');
}

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

// A name may hold anything; what shows it has one line.
QString oneLine(QString name)
{
    return name.replace(QLatin1Char('\n'), QLatin1Char(' ')).replace(QLatin1Char('\r'), QLatin1Char(' '));
}

// A terminal would obey control characters.
QString plain(const QString &name)
{
    return TerminalText::plain(oneLine(name));
}

// In a label an underscore marks the letter to press; two of them are one to show.
QString label(const QString &name)
{
    return writable(oneLine(name)).replace(QLatin1Char('_'), QStringLiteral("__"));
}

void writeOpenbox(QXmlStreamWriter *xml, const QVector<MenuItem> &items)
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
        xml->writeAttribute(QStringLiteral("label"), label(item.name));
        if (item.icon.startsWith(QLatin1Char('/')))
            xml->writeAttribute(QStringLiteral("icon"), writable(item.icon));
        if (isFolder) {
            writeOpenbox(xml, item.children);
        } else {
            xml->writeStartElement(QStringLiteral("action"));
            xml->writeAttribute(QStringLiteral("name"), QStringLiteral("Execute"));
            xml->writeTextElement(QStringLiteral("command"),
                                  writable(QStringLiteral("vel-open --exec ") + quoted(item.path)));
            xml->writeEndElement();
        }
        xml->writeEndElement();
    }
}

QJsonObject object(const MenuItem &item)
{
    static const QString kinds[] = {QStringLiteral("folder"), QStringLiteral("entry"),
                                    QStringLiteral("separator"), QStringLiteral("file")};
    QJsonObject result{{QStringLiteral("kind"), kinds[item.kind]},
                       {QStringLiteral("name"), item.name},
                       {QStringLiteral("path"), item.path}};
    if (!item.icon.isEmpty())
        result.insert(QStringLiteral("icon"), item.icon);
    if (!item.exec.isEmpty())
        result.insert(QStringLiteral("exec"), item.exec);
    if (item.kind == MenuItem::Folder) {
        QJsonArray children;
        for (const MenuItem &child : item.children)
            children.append(object(child));
        result.insert(QStringLiteral("children"), children);
    }
    return result;
}

void writeText(QByteArray *out, const MenuItem &item, int depth)
{
    out->append(QByteArray(depth * 4, ' '));
    out->append(item.kind == MenuItem::Separator ? QByteArray("--") : plain(item.name).toUtf8());
    out->append(item.kind == MenuItem::Folder ? "/\n" : "\n");
    for (const MenuItem &child : item.children)
        writeText(out, child, depth + 1);
}

} // namespace

QByteArray MenuFormat::openbox(const MenuItem &menu)
{
    QByteArray out;
    QXmlStreamWriter xml(&out);
    xml.setAutoFormatting(true);
    xml.writeStartDocument();
    xml.writeStartElement(QStringLiteral("openbox_pipe_menu"));
    writeOpenbox(&xml, menu.children);
    xml.writeEndElement();
    xml.writeEndDocument();
    return out;
}

QByteArray MenuFormat::json(const MenuItem &menu)
{
    return QJsonDocument(object(menu)).toJson();
}

QByteArray MenuFormat::text(const MenuItem &menu)
{
    QByteArray out;
    writeText(&out, menu, 0);
    return out;
}
