// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ThemeRcFormat.h"

#include "LineBreaks.h"

#include <frame/QtMajor.h>

#include <QFileDevice>

#include <algorithm>
#include <cstdio>
#include <cstring>
#include <limits>
#include <utility>

namespace {

const QString &sectionKey()
{
    static const QString key = QStringLiteral("SectionName");
    return key;
}

// Lines come as QStringView or, where they are ASCII, as QLatin1String: nearly all are, and
// decoding them takes as long as all else. What follows serves both.

QString toString(QStringView text)
{
    return text.toString();
}

QString toString(QLatin1String text)
{
    return text;
}

int indexOf(QStringView text, char character)
{
    return int(text.indexOf(QLatin1Char(character)));
}

int indexOf(QLatin1String text, char character)
{
    const void *const found = std::memchr(text.data(), character, size_t(text.size()));
    return found ? int(static_cast<const char *>(found) - text.data()) : -1;
}

int digitValue(QChar character)
{
    const int value = character.unicode() - '0';
    return value <= 9 ? value : -1;
}

int digitValue(char character)
{
    return digitValue(QChar::fromLatin1(character));
}

template <typename Text>
bool isNumber(Text text)
{
    return !text.isEmpty()
        && std::all_of(text.begin(), text.end(), [](auto character) { return digitValue(character) >= 0; });
}

// The number that the digits make; 0 beyond the range.
template <typename Text>
int number(Text digits)
{
    qint64 result = 0;
    for (const auto digit : digits) {
        result = 10 * result + digitValue(digit);
        if (result > std::numeric_limits<int>::max())
            return 0;
    }
    return int(result);
}

// A single quote character is a value like any other, in both directions.
template <typename Text>
bool isQuoted(Text text)
{
    return text.size() >= 2 && text.startsWith(QLatin1Char('"')) && text.endsWith(QLatin1Char('"'));
}

template <typename Text>
QVariant typedValue(Text text)
{
    if (text == QLatin1String("true") || text == QLatin1String("True"))
        return true;
    if (text == QLatin1String("false") || text == QLatin1String("False"))
        return false;
    if (isNumber(text))
        return number(text);
    return toString(isQuoted(text) ? text.mid(1, text.size() - 2) : text);
}

// Fills the map. The name of the section comes last: in a sorted file it is the one key that may stand
// before smaller ones, and each of those would have to look for its place.
class MapFiller
{
public:
    explicit MapFiller(QSettings::SettingsMap &map)
        : m_map(map)
    {
    }

    void add(const QString &key, QVariant &&value)
    {
        if (key == sectionKey())
            m_section = std::move(value);
        else // at the end; the place is looked for only when it is not there; no value is copied
            *m_map.insert(m_map.constEnd(), key, QVariant()) = std::move(value);
    }

    void finish()
    {
        if (m_section.isValid())
            m_map.insert(sectionKey(), m_section);
    }

private:
    QSettings::SettingsMap &m_map;
    QVariant m_section;
};

template <typename Text>
void readKey(Text key, Text value, MapFiller &map)
{
    if (!key.isEmpty() && !value.isEmpty())
        map.add(toString(key), typedValue(value));
}

template <typename Text>
void readLine(Text line, MapFiller &map)
{
    if (line.startsWith(QLatin1Char('#')) || line.startsWith(QLatin1Char(';')))
        return;
    const int separator = indexOf(line, '=');
    if (separator >= 0) {
        readKey(line.left(separator).trimmed(), line.mid(separator + 1).trimmed(), map);
    } else if (line.startsWith(QLatin1Char('[')) && line.endsWith(QLatin1Char(']'))) {
        QString name = toString(line);
        name.remove(QLatin1Char('[')).remove(QLatin1Char(']'));
        map.add(sectionKey(), name.trimmed());
    }
}

// What QByteArray::trimmed() strips.
bool isSpace(char byte)
{
    return byte == ' ' || (byte >= '\t' && byte <= '\r');
}

bool isAscii(const char *bytes, int size)
{
    quint64 all = 0;
    for (; size >= int(sizeof all); size -= int(sizeof all), bytes += sizeof all) {
        quint64 some;
        std::memcpy(&some, bytes, sizeof some);
        all |= some;
    }
    for (; size > 0; --size, ++bytes)
        all |= uchar(*bytes);
    return !(all & Q_UINT64_C(0x8080808080808080));
}

// Reads one line, without its end. Its text ends at the first NUL byte.
void readBytes(const char *begin, const char *end, bool asciiAsIs, MapFiller &map)
{
    while (begin != end && isSpace(*begin))
        ++begin;
    while (begin != end && isSpace(end[-1]))
        --end;
    const int size = int(strnlen(begin, size_t(end - begin)));
    if (asciiAsIs && isAscii(begin, size))
        readLine(QLatin1String(begin, size), map);
    else
        readLine(QStringView(QString::fromLocal8Bit(begin, size)), map);
}

QString sectionLine(const QIODevice &device, const QVariant &value)
{
    const QString name = value.toString();
    if (LineBreaks::areIn(name))
        LineBreaks::tell(device, QStringLiteral("the section's name"));
    return QLatin1Char('[') + LineBreaks::toBlanks(name) + QLatin1String("]\n");
}

void appendLine(QString &lines, const QString &key, const QString &text)
{
    const bool hasBlank = text.contains(QLatin1Char(' ')) || text.contains(QLatin1Char('\t'));
    const bool needsQuotes = hasBlank && !isQuoted(QStringView(text));
    lines.append(key).append(QLatin1Char('='));
    if (needsQuotes)
        lines.append(QLatin1Char('"'));
    lines.append(text);
    if (needsQuotes)
        lines.append(QLatin1Char('"'));
    lines.append(QLatin1Char('\n'));
}

void appendKey(QString &lines, const QIODevice &device, const QString &key, const QVariant &value)
{
    const QString text = value.toString();
    if (!LineBreaks::areIn(key) && !LineBreaks::areIn(text)) {
        appendLine(lines, key, text);
        return;
    }
    LineBreaks::tell(device, QStringLiteral("the line of '%1'").arg(key));
    appendLine(lines, LineBreaks::toBlanks(key), LineBreaks::toBlanks(text));
}

} // namespace

namespace ThemeRcFormat {

bool read(QIODevice &device, QSettings::SettingsMap &map)
{
    if (!device.isOpen()) {
        std::fputs("VelSettings: file isn't open - can't read from\n", stderr);
        return false;
    }
    map.clear();

    const QByteArray bytes = device.readAll();
    // Half a file must not pass for the whole: the next write would lose the rest.
    if (!device.atEnd())
        return false;

    MapFiller filler(map);
    // In UTF-8, ASCII bytes stand for themselves, whatever comes before.
    const bool asciiAsIs = QtMajor::isLocaleUtf8();
    const char *line = bytes.constData();
    const char *const end = line + bytes.size();
    while (line != end) {
        const void *const feed = std::memchr(line, '\n', size_t(end - line));
        const char *const lineEnd = feed ? static_cast<const char *>(feed) : end;
        readBytes(line, lineEnd, asciiAsIs, filler);
        line = feed ? lineEnd + 1 : end;
    }
    filler.finish();
    return true;
}

bool write(QIODevice &device, const QSettings::SettingsMap &map)
{
    if (!device.isOpen() || map.isEmpty()) {
        std::fputs("VelSettings: file isn't open or settings are empty\n", stderr);
        return false;
    }
    if (!device.isWritable()) {
        std::fputs("VelSettings: file isn't writable\n", stderr);
        return false;
    }
    // Some encodings begin or end every text with marks: there each line is converted by itself.
    const bool allAtOnce = QtMajor::isLocaleUtf8();
    QByteArray bytes;
    QString lines;
    const auto section = map.constFind(sectionKey());
    if (section != map.constEnd())
        lines = sectionLine(device, section.value());
    for (auto it = map.constBegin(); it != map.constEnd(); ++it) {
        if (it == section)
            continue;
        if (!allAtOnce) {
            bytes += lines.toLocal8Bit();
            lines.clear();
        }
        appendKey(lines, device, it.key(), it.value());
    }
    // Half a character is a question mark in every file; Qt 6 has another sign for it in the locale's text.
    bytes += allAtOnce ? lines.toUtf8() : lines.toLocal8Bit();
    return writeThrough(device, bytes);
}

bool writeThrough(QIODevice &device, const QByteArray &bytes)
{
    if (device.write(bytes) != bytes.size())
        return false;
    auto *file = qobject_cast<QFileDevice *>(&device);
    return !file || file->flush();
}

} // namespace ThemeRcFormat
