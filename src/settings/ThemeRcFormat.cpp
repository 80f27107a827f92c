// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ThemeRcFormat.h"

#include <QFileDevice>

#include <cstdio>
#include <cstring>

namespace {

const QString &sectionKey()
{
    static const QString key = QStringLiteral("SectionName");
    return key;
}

bool isDigit(QChar character)
{
    return character >= QLatin1Char('0') && character <= QLatin1Char('9');
}

bool isNumber(const QString &value)
{
    for (const QChar character : value) {
        if (!isDigit(character))
            return false;
    }
    return !value.isEmpty();
}

// A single quote character is a value like any other, in both directions.
bool isQuoted(const QString &value)
{
    return value.size() >= 2 && value.startsWith(QLatin1Char('"')) && value.endsWith(QLatin1Char('"'));
}

QVariant typedValue(const QString &value)
{
    if (value == QLatin1String("true") || value == QLatin1String("True"))
        return true;
    if (value == QLatin1String("false") || value == QLatin1String("False"))
        return false;
    if (isNumber(value))
        return value.toInt(); // 0 beyond the range
    return isQuoted(value) ? value.mid(1, value.size() - 2) : value;
}

void readEntry(const QString &line, int separator, QSettings::SettingsMap &map)
{
    const QString key = line.leftRef(separator).trimmed().toString();
    const QString value = line.midRef(separator + 1).trimmed().toString();
    if (key.isEmpty() || value.isEmpty())
        return;
    // Written files are sorted: the place is at the end, and looked for only when it is not.
    map.insert(map.constEnd(), key, typedValue(value));
}

void readLine(const QString &line, QSettings::SettingsMap &map)
{
    if (line.startsWith(QLatin1Char('#')) || line.startsWith(QLatin1Char(';')))
        return;
    const int separator = line.indexOf(QLatin1Char('='));
    if (separator >= 0) {
        readEntry(line, separator, map);
    } else if (line.startsWith(QLatin1Char('[')) && line.endsWith(QLatin1Char(']'))) {
        QString name = line;
        name.remove(QLatin1Char('[')).remove(QLatin1Char(']'));
        map.insert(sectionKey(), name.trimmed());
    }
}

// What QByteArray::trimmed() strips.
bool isSpace(char byte)
{
    return byte == ' ' || (byte >= '\t' && byte <= '\r');
}

// The text of one line; it ends at the first NUL byte.
QString lineText(const char *begin, const char *end)
{
    while (begin != end && isSpace(*begin))
        ++begin;
    while (begin != end && isSpace(end[-1]))
        --end;
    return QString::fromLocal8Bit(begin, int(strnlen(begin, size_t(end - begin))));
}

QByteArray sectionLine(const QVariant &name)
{
    return (QLatin1Char('[') + name.toString() + QLatin1String("]\n")).toLocal8Bit();
}

QByteArray entryLine(const QString &key, const QVariant &value)
{
    QString text = value.toString();
    const bool hasBlank = text.contains(QLatin1Char(' ')) || text.contains(QLatin1Char('\t'));
    if (hasBlank && !isQuoted(text))
        text = QLatin1Char('"') + text + QLatin1Char('"');
    return QString(key + QLatin1Char('=') + text + QLatin1Char('\n')).toLocal8Bit();
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

    const char *line = bytes.constData();
    const char *const end = line + bytes.size();
    while (line != end) {
        const void *const feed = std::memchr(line, '\n', size_t(end - line));
        const char *const lineEnd = feed ? static_cast<const char *>(feed) : end;
        readLine(lineText(line, lineEnd), map);
        line = feed ? lineEnd + 1 : end;
    }
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
    // Each line is converted by itself: some encodings begin or end every text with marks.
    QByteArray bytes;
    const auto section = map.constFind(sectionKey());
    if (section != map.constEnd())
        bytes += sectionLine(section.value());
    for (auto entry = map.constBegin(); entry != map.constEnd(); ++entry) {
        if (entry != section)
            bytes += entryLine(entry.key(), entry.value());
    }
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
