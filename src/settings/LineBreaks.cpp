// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "LineBreaks.h"

#include <QFileDevice>

#include <cstdio>

namespace {

constexpr QLatin1Char LineFeed('\n');
constexpr QLatin1Char CarriageReturn('\r');

// A key may hold anything; on a terminal it must not act.
QString withoutControls(const QString &text)
{
    QString result;
    for (const QChar character : text) {
        const ushort code = character.unicode();
        if (code < 0x20 || (code >= 0x7f && code < 0xa0))
            result += QStringLiteral("\\x%1").arg(code, 2, 16, QLatin1Char('0'));
        else
            result += character;
    }
    return result;
}

} // namespace

bool LineBreaks::areIn(const QString &text)
{
    return text.contains(LineFeed) || text.contains(CarriageReturn);
}

QString LineBreaks::toBlanks(QString text)
{
    return text.replace(LineFeed, QLatin1Char(' ')).replace(CarriageReturn, QLatin1Char(' '));
}

void LineBreaks::tell(const QIODevice &device, const QString &place)
{
    const auto *const file = qobject_cast<const QFileDevice *>(&device);
    const QString name = file ? file->fileName() + QLatin1String(": ") : QString();
    const QByteArray where = withoutControls(name).toLocal8Bit();
    const QByteArray what = withoutControls(place).toLocal8Bit();
    std::fprintf(stderr, "VelSettings: %sline breaks in %s are written as blanks\n", where.constData(),
                 what.constData());
}
