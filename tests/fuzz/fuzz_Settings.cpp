// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// A settings file: read, given one more key, written and read again. The first line of an input is
// the value of that key, in which a percent sign stands for a line feed; the rest is the file.

#include "FuzzTarget.h"

#include <settings/ThemeRcFormat.h>

#include <QBuffer>
#include <QSet>

#include <algorithm>

using Map = QSettings::SettingsMap;

namespace {

Map mapOf(QByteArray bytes)
{
    QBuffer buffer(&bytes);
    buffer.open(QIODevice::ReadOnly);
    Map map;
    Fuzz::require(ThemeRcFormat::read(buffer, map), "any bytes can be read");
    return map;
}

QByteArray bytesOf(const Map &map)
{
    QBuffer buffer;
    buffer.open(QIODevice::ReadWrite);
    Fuzz::require(ThemeRcFormat::write(buffer, map), "any settings can be written");
    return buffer.data();
}

// Words that mean no more than their letters. The format has no quoting for quotes, blanks at the
// ends and the like, and texts that look like numbers or truth values become such.
bool isPlain(const QString &text)
{
    const QString lower = text.toLower();
    return !text.isEmpty() && text.at(0).isLetter() && lower != QLatin1String("true")
        && lower != QLatin1String("false") && std::all_of(text.begin(), text.end(), [](QChar character) {
               return character.unicode() < 0x80 && character.isLetterOrNumber();
           });
}

// The keys as they are written: with blanks for line breaks.
QSet<QString> keysOf(const Map &map)
{
    QSet<QString> keys;
    for (auto it = map.begin(); it != map.end(); ++it)
        keys.insert(QString(it.key()).replace(QLatin1Char('\r'), QLatin1Char(' ')));
    return keys;
}

} // namespace

void Fuzz::test(const QByteArray &input)
{
    const Parts parts = cut(input);
    Map map = mapOf(parts.rest);
    // A section with such a name reads as a key.
    if (map.value(QStringLiteral("SectionName")).toString().contains(QLatin1Char('=')))
        map.remove(QStringLiteral("SectionName"));
    map.insert(QStringLiteral("extra"),
               QString::fromUtf8(parts.head).replace(QLatin1Char('%'), QLatin1Char('\n')));

    const Map again = mapOf(bytesOf(map));
    const QSet<QString> keys = keysOf(map);
    for (auto it = again.begin(); it != again.end(); ++it)
        require(keys.contains(it.key()), "no value makes a key or a section");
    for (auto it = map.begin(); it != map.end(); ++it) {
        if (isPlain(it.key()) && isPlain(it.value().toString()))
            require(again.value(it.key()).toString() == it.value().toString(), "plain words read back");
    }
}
