// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// Bytes of the command channel, which arrive in pieces. The first line of an input says how long
// the pieces are, a byte each; the rest are the bytes.

#include "FuzzTarget.h"

#include <CommandLines.h>

#include <velintegration/wmcommand.h>

#include <QList>

#include <vector>

namespace {

using Lines = std::vector<std::string>;

// The rule as it is written: whole lines, but for those that are too long.
Lines linesOf(const QByteArray &bytes)
{
    Lines lines;
    QList<QByteArray> parts = bytes.split('\n');
    parts.removeLast();
    for (const QByteArray &part : qAsConst(parts)) {
        if (std::size_t(part.size()) <= VelWmCommand::LongestLine)
            lines.push_back(part.toStdString());
    }
    return lines;
}

void takeAll(CommandLines *receiver, Lines *lines)
{
    for (std::string line; receiver->take(&line);)
        lines->push_back(line);
}

} // namespace

void Fuzz::test(const QByteArray &input)
{
    const Parts parts = cut(input);
    // So that long lines are met with short inputs.
    QByteArray bytes = parts.rest;
    bytes.replace("~", QByteArray(1400, 'x'));
    CommandLines receiver;
    Lines lines;
    for (int at = 0, i = 0; at < bytes.size(); ++i) {
        const int size = parts.head.isEmpty() ? 512 : 1 + 16 * uchar(parts.head.at(i % parts.head.size()));
        const QByteArray piece = bytes.mid(at, size);
        receiver.append(piece.constData(), std::size_t(piece.size()));
        if (i % 3 != 2)
            takeAll(&receiver, &lines);
        at += size;
    }
    takeAll(&receiver, &lines);
    require(lines == linesOf(bytes), "the lines do not depend on the pieces that they come in");

    // A client that died in the middle of a line takes nothing of the next one along.
    receiver.dropHalf();
    receiver.append("next\n", 5);
    Lines next;
    takeAll(&receiver, &next);
    require(next == Lines{"next"}, "half a line does not swallow the next one");
}
