// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FieldCodes.h"

namespace VelUI {

namespace {

bool isPercentSign(const QString &code)
{
    return code == QLatin1String("%%");
}

// Behind "--file=" and within quotes a code is meant to be a part of the word.
bool endsWord(QChar c)
{
    return !c.isSpace() && c != QLatin1Char('=') && c != QLatin1Char('"') && c != QLatin1Char('\'');
}

} // namespace

QVector<FieldCodes::Code> FieldCodes::all()
{
    return {
        {QStringLiteral("%f"), tr("%f: one file; for several files the program is started several times")},
        {QStringLiteral("%F"), tr("%F: all files, each as a word of its own")},
        {QStringLiteral("%u"),
         tr("%u: one address (URL) or file; for several the program is started "
            "several times")},
        {QStringLiteral("%U"), tr("%U: all addresses (URLs) or files, each as a word of its own")},
        {QStringLiteral("%i"), tr("%i: --icon and the icon of this entry, if it has one")},
        {QStringLiteral("%c"), tr("%c: the name of this entry, translated")},
        {QStringLiteral("%k"), tr("%k: where the file of this entry lies")},
        {QStringLiteral("%%"), tr("%%: a percent sign")},
    };
}

int FieldCodes::place(const QString &command, int position)
{
    return command.left(position).trimmed().isEmpty() ? command.size() : position;
}

QString FieldCodes::insertion(const QString &command, int position, const QString &code)
{
    const bool isAtEndOfWord = position > 0 && position == command.size() && endsWord(command.back());
    return isAtEndOfWord && !isPercentSign(code) ? QLatin1Char(' ') + code : code;
}

} // namespace VelUI
