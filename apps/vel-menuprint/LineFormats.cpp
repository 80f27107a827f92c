// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuFormat.h"

#include "MenuLines.h"
#include "MenuTree.h"
#include "OpenCommand.h"

#include <support/TerminalText.h>

namespace {

// Neither a terminal nor what shows lines is to obey what a name holds.
QString plain(const QString &name)
{
    return TerminalText::plain(TerminalText::onOneLine(name));
}

// A path of several lines would end the line of its item.
bool isOnOneLine(const QString &path)
{
    return !path.contains(QLatin1Char('\n'));
}

QString indentation(int depth)
{
    return QString(depth * 4, QLatin1Char(' '));
}

// A field of Fluxbox's menus. A backslash keeps what closes the field from doing so, and stands for itself
// before all else.
QString field(char opening, const QString &text, char closing)
{
    QString result = text;
    result.replace(QLatin1Char(closing), QString(QLatin1Char('\\')) + QLatin1Char(closing));
    if (result.endsWith(QLatin1Char('\\')))
        result += QLatin1Char(' ');
    return QString(QLatin1Char(opening)) + result + QLatin1Char(closing);
}

void writeFluxbox(QString *out, const QVector<MenuItem> &items, int depth)
{
    for (const MenuItem &item : items) {
        if (!isOnOneLine(item.path))
            continue;
        *out += indentation(depth);
        if (item.kind == MenuItem::Separator) {
            *out += QLatin1String("[separator]\n");
            continue;
        }
        const QString label = field('(', plain(item.name), ')');
        const bool hasIcon = !item.icon.isEmpty() && isOnOneLine(item.icon);
        const QString end = hasIcon ? QLatin1Char(' ') + field('<', item.icon, '>') + QLatin1Char('\n')
                                    : QStringLiteral("\n");
        if (item.kind == MenuItem::Folder) {
            *out += QLatin1String("[submenu] ") + label + end;
            writeFluxbox(out, item.children, depth + 1);
            *out += indentation(depth) + QLatin1String("[end]\n");
        } else {
            *out += QLatin1String("[exec] ") + label + QLatin1Char(' ')
                + field('{', OpenCommand::of(item.path), '}') + end;
        }
    }
}

// A name or an icon in IceWM's menus. A backslash keeps a quote from ending it, and stands for itself
// before all else.
QString word(QString text)
{
    text.replace(QLatin1Char('"'), QStringLiteral("\\\""));
    if (text.endsWith(QLatin1Char('\\')))
        text += QLatin1Char(' ');
    return QLatin1Char('"') + text + QLatin1Char('"');
}

// An underscore marks the letter to press; two of them are one to show.
QString labelOf(const QString &text)
{
    return word(plain(text).replace(QLatin1Char('_'), QStringLiteral("__")));
}

void writeIcewm(QString *out, const QVector<MenuItem> &items, int depth)
{
    for (const MenuItem &item : items) {
        if (!isOnOneLine(item.path))
            continue;
        // A dash stands for no icon.
        const QString icon =
            item.icon.isEmpty() || !isOnOneLine(item.icon) ? QStringLiteral("-") : word(item.icon);
        const QString begin = labelOf(item.name) + QLatin1Char(' ') + icon;
        *out += indentation(depth);
        if (item.kind == MenuItem::Separator) {
            *out += QLatin1String("separator\n");
        } else if (item.kind == MenuItem::Folder) {
            *out += QLatin1String("menu ") + begin + QLatin1String(" {\n");
            writeIcewm(out, item.children, depth + 1);
            *out += indentation(depth) + QLatin1String("}\n");
        } else {
            *out += QLatin1String("prog ") + begin + QLatin1Char(' ') + OpenCommand::of(item.path)
                + QLatin1Char('\n');
        }
    }
}

void writeText(QString *out, const MenuItem &item, int depth)
{
    *out += indentation(depth);
    *out += item.kind == MenuItem::Separator ? QStringLiteral("--") : plain(item.name);
    *out += item.kind == MenuItem::Folder ? QLatin1String("/\n") : QLatin1String("\n");
    for (const MenuItem &child : item.children)
        writeText(out, child, depth + 1);
}

} // namespace

QByteArray MenuFormat::fluxbox(const MenuItem &menu)
{
    QString out = QStringLiteral("[encoding] {UTF-8}\n");
    writeFluxbox(&out, menu.children, 0);
    return (out + QLatin1String("[endencoding]\n")).toUtf8();
}

QByteArray MenuFormat::fluxboxText(const QString &text)
{
    return "[encoding] {UTF-8}\n[nop] " + field('(', plain(text), ')').toUtf8() + "\n[endencoding]\n";
}

QByteArray MenuFormat::icewm(const MenuItem &menu)
{
    QString out;
    writeIcewm(&out, menu.children, 0);
    return out.toUtf8();
}

QByteArray MenuFormat::icewmText(const QString &text)
{
    return "prog " + labelOf(text).toUtf8() + " - true\n";
}

QByteArray MenuFormat::rofi(const MenuItem &menu)
{
    QByteArray out;
    const auto lines = MenuLines::of(menu);
    for (const MenuLines::Line &line : lines) {
        out += line.text.toUtf8();
        if (!line.icon.isEmpty() && isOnOneLine(line.icon))
            out += QByteArray("\0icon\x1f", 6) + line.icon.toUtf8();
        out += '\n';
    }
    return out;
}

QByteArray MenuFormat::dmenu(const MenuItem &menu)
{
    QByteArray out;
    const auto lines = MenuLines::of(menu);
    for (const MenuLines::Line &line : lines)
        out += line.text.toUtf8() + '\n';
    return out;
}

QByteArray MenuFormat::text(const MenuItem &menu)
{
    QString out;
    writeText(&out, menu, 0);
    return out.toUtf8();
}
