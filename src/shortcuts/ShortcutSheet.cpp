// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ShortcutSheet.h"

#include "DisplayWidth.h"
#include "IShortcutObject.h"
#include "ShortcutRows.h"
#include "ShortcutsModel.h"
#include "ShownKeys.h"

#include <QCoreApplication>
#include <QLocale>

#include <algorithm>

namespace {

struct Line
{
    QString text;
    QString key;
};

struct Section
{
    QString name;
    QVector<Line> lines;
};

// On one line, and without what no text file and no HTML document may hold.
QString printable(const QString &text)
{
    QString clean;
    const QVector<uint> characters = text.simplified().toUcs4();
    for (const char32_t character : characters) {
        if (QChar::category(character) != QChar::Other_Control && !QChar::isNonCharacter(character))
            clean += QString::fromUcs4(&character, 1);
    }
    return clean.simplified();
}

QVector<Section> sectionsOf(const ShortcutsModel &model)
{
    QVector<Section> sections;
    for (int group = 0; group < model.rowCount(); ++group) {
        Section section = {printable(model.index(group, 0).data().toString()), {}};
        const QVector<const IShortcutObject *> objects = ShortcutRows::ofGroup(model, group);
        for (const IShortcutObject *object : objects) {
            if (object)
                section.lines.append({printable(object->text()),
                                      printable(ShownKeys::of(*object, QKeySequence::NativeText))});
        }
        if (!section.lines.isEmpty())
            sections.append(section);
    }
    return sections;
}

QString title()
{
    return QCoreApplication::translate("ShortcutSheet", "Keyboard shortcuts", "title of a printed sheet");
}

// Names and keys keep their own direction in a text of the other one.
constexpr char Style[] =
    "body { font-family: sans-serif; }\n"
    "table { border-collapse: collapse; width: 100%; }\n"
    "th, td { border-bottom: 1px solid #999; padding: 0.2em 0.5em; text-align: start; }\n"
    "th, td:last-child { width: 35%; }\n"
    "kbd { font-family: inherit; white-space: nowrap; unicode-bidi: isolate; }\n"
    "@media print { tr { break-inside: avoid; } h2 { break-after: avoid; } }\n";

QString head()
{
    const QLocale locale;
    const bool isRightToLeft = locale.textDirection() == Qt::RightToLeft;
    return QStringLiteral("<!DOCTYPE html>\n<html lang=\"%1\"%2>\n<head>\n<meta charset=\"utf-8\">\n"
                          "<title>%3</title>\n<style>\n%4</style>\n</head>\n<body>\n<h1>%3</h1>\n")
        .arg(locale.bcp47Name(), isRightToLeft ? QStringLiteral(" dir=\"rtl\"") : QString(),
             title().toHtmlEscaped(), QLatin1String(Style));
}

QString tableHead(const ShortcutsModel &model)
{
    return QStringLiteral("<table>\n<thead>\n<tr><th scope=\"col\">%1</th><th scope=\"col\">%2</th></tr>\n"
                          "</thead>\n<tbody>\n")
        .arg(model.headerData(0, Qt::Horizontal).toString().toHtmlEscaped(),
             model.headerData(1, Qt::Horizontal).toString().toHtmlEscaped());
}

QString htmlOf(const Line &line)
{
    const QString key =
        line.key.isEmpty() ? QString() : QStringLiteral("<kbd>%1</kbd>").arg(line.key.toHtmlEscaped());
    return QStringLiteral("<tr><td><bdi>%1</bdi></td><td>%2</td></tr>\n").arg(line.text.toHtmlEscaped(), key);
}

} // namespace

QString ShortcutSheet::html(const ShortcutsModel &model)
{
    QString html = head();
    const QString startOfTable = tableHead(model);
    const QVector<Section> sections = sectionsOf(model);
    for (const Section &section : sections) {
        if (!section.name.isEmpty())
            html += QStringLiteral("<h2>%1</h2>\n").arg(section.name.toHtmlEscaped());
        html += startOfTable;
        for (const Line &line : section.lines)
            html += htmlOf(line);
        html += QLatin1String("</tbody>\n</table>\n");
    }
    return html + QLatin1String("</body>\n</html>\n");
}

QString ShortcutSheet::plainText(const ShortcutsModel &model)
{
    const QVector<Section> sections = sectionsOf(model);
    int widest = 0;
    for (const Section &section : sections) {
        for (const Line &line : section.lines)
            widest = std::max(widest, DisplayWidth::of(line.text));
    }
    QString text;
    for (const Section &section : sections) {
        if (!text.isEmpty())
            text += QLatin1Char('\n');
        if (!section.name.isEmpty())
            text += section.name + QLatin1Char('\n');
        for (const Line &line : section.lines) {
            text += QLatin1String("  ") + line.text;
            if (!line.key.isEmpty())
                text += QString(widest - DisplayWidth::of(line.text) + 2, QLatin1Char(' ')) + line.key;
            text += QLatin1Char('\n');
        }
    }
    return text;
}
