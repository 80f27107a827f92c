// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuLines.h"

#include "MenuTree.h"

#include <support/TerminalText.h>

#include <QHash>
#include <QSet>

namespace {

using MenuLines::Line;

void append(QVector<Line> *lines, const MenuItem &folder, const QString &above)
{
    for (const MenuItem &item : folder.children) {
        const QString text = above + TerminalText::plain(TerminalText::onOneLine(item.name));
        if (item.kind == MenuItem::Folder)
            append(lines, item, text + QLatin1String(" > "));
        else if (item.kind != MenuItem::Separator)
            lines->append({text, item.path, item.icon});
    }
}

} // namespace

QVector<Line> MenuLines::of(const MenuItem &menu)
{
    QVector<Line> lines;
    append(&lines, menu, QString());
    // A number must not make a line the same as one that is called so.
    QSet<QString> taken;
    QHash<QString, int> seen;
    for (const Line &line : qAsConst(lines))
        taken.insert(line.text);
    for (Line &line : lines) {
        const QString name = line.text;
        int &number = seen[name];
        if (++number == 1)
            continue;
        do
            line.text = QStringLiteral("%1 (%2)").arg(name).arg(number);
        while (taken.contains(line.text) && ++number);
        taken.insert(line.text);
    }
    return lines;
}
