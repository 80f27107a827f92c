// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "SchemeText.h"

#include "KeySequences.h"

#include <cctype>
#include <optional>

namespace {

constexpr char Header[] = "[Shortcuts]";

bool isPlainInName(ushort code)
{
    return (code >= 'a' && code <= 'z') || (code >= 'A' && code <= 'Z') || (code >= '0' && code <= '9')
        || code == '_' || code == '-' || code == '.';
}

QByteArray escapedName(const QString &name)
{
    QByteArray escaped;
    for (const QChar character : name) {
        const ushort code = character.unicode();
        if (code == '/')
            escaped += '\\';
        else if (isPlainInName(code))
            escaped += char(code);
        else if (code <= 0xff)
            escaped += '%' + QByteArray::number(code, 16).toUpper().rightJustified(2, '0');
        else
            escaped += "%U" + QByteArray::number(code, 16).toUpper().rightJustified(4, '0');
    }
    return escaped;
}

// The character that an escape of a name stands for, and how long the escape is.
std::optional<QChar> unescaped(const QByteArray &escaped, int at, int *length)
{
    const bool isWide = escaped.mid(at + 1, 1) == "U";
    const int digits = isWide ? 4 : 2;
    *length = digits + (isWide ? 2 : 1);
    const QByteArray number = escaped.mid(at + *length - digits, digits);
    bool isNumber = number.size() == digits;
    for (const char digit : number)
        isNumber = isNumber && std::isxdigit(static_cast<unsigned char>(digit));
    return isNumber ? std::optional<QChar>(QChar(number.toUShort(nullptr, 16))) : std::nullopt;
}

QString unescapedName(const QByteArray &escaped)
{
    QString name;
    int plainBegin = 0;
    const auto takePlain = [&](int end) {
        name += QString::fromUtf8(escaped.mid(plainBegin, end - plainBegin));
    };
    for (int at = 0; at < escaped.size(); ++at) {
        int length = 1;
        std::optional<QChar> character;
        if (escaped.at(at) == '\\')
            character = QLatin1Char('/');
        else if (escaped.at(at) == '%')
            character = unescaped(escaped, at, &length);
        if (!character)
            continue;
        takePlain(at);
        name += *character;
        plainBegin = at + length;
        at = plainBegin - 1;
    }
    takePlain(escaped.size());
    return name;
}

// Always in quotes, which QSettings takes off as well.
QByteArray escapedValue(const QString &text)
{
    QByteArray escaped(1, '"');
    // QSettings has a meaning of its own for values that begin with "@", unless it is doubled.
    if (text.startsWith(QLatin1Char('@')))
        escaped += '@';
    bool isAfterNumber = false;
    for (const QChar character : text) {
        const ushort code = character.unicode();
        const bool isDigit = code < 0x80 && std::isxdigit(code);
        if (code < 0x20 || code > 0x7e || (isAfterNumber && isDigit)) {
            escaped += "\\x" + QByteArray::number(code, 16);
            isAfterNumber = true;
            continue;
        }
        isAfterNumber = false;
        if (code == '"' || code == '\\')
            escaped += '\\';
        escaped += char(code);
    }
    return escaped + '"';
}

// A number behind "\x": all hexadecimal digits that follow.
std::optional<QChar> hexCharacter(const QByteArray &escaped, int *at)
{
    uint code = 0;
    const int begin = *at + 1;
    int end = begin;
    while (end < escaped.size() && std::isxdigit(static_cast<unsigned char>(escaped.at(end)))
           && end < begin + 5)
        ++end;
    code = escaped.mid(begin, end - begin).toUInt(nullptr, 16);
    *at = end - 1;
    return end == begin || code > 0xffff ? std::nullopt : std::optional<QChar>(QChar(code));
}

// Nothing for quotes that do not close and escapes that there are not.
std::optional<QString> unescapedValue(const QByteArray &escaped)
{
    QString text;
    QByteArray plain;
    bool isQuoted = false;
    for (int at = 0; at < escaped.size(); ++at) {
        const char byte = escaped.at(at);
        if (byte == '"') {
            isQuoted = !isQuoted;
            continue;
        }
        if (byte != '\\') {
            plain += byte;
            continue;
        }
        const char kind = escaped.mid(++at, 1).isEmpty() ? '\0' : escaped.at(at);
        if (kind == '"' || kind == '\\') {
            plain += kind;
            continue;
        }
        const std::optional<QChar> character =
            kind == 'x' ? hexCharacter(escaped, &at) : std::optional<QChar>();
        if (!character)
            return std::nullopt;
        text += QString::fromUtf8(plain) + *character;
        plain.clear();
    }
    text += QString::fromUtf8(plain);
    if (isQuoted)
        return std::nullopt;
    return text.startsWith(QLatin1String("@@")) ? text.mid(1) : text;
}

std::optional<QKeySequence> keyOf(const QByteArray &value)
{
    const std::optional<QString> text = unescapedValue(value);
    if (!text)
        return std::nullopt;
    const QKeySequence key(*text, QKeySequence::PortableText);
    const bool isReadable = text->isEmpty() || (!key.isEmpty() && KeySequences::isKnown(key));
    return isReadable && KeySequences::survivesSaving(key) ? std::optional<QKeySequence>(key) : std::nullopt;
}

void readLine(const QByteArray &line, SchemeText::Contents *contents)
{
    const int equals = line.indexOf('=');
    const QString name = unescapedName(line.left(equals).trimmed());
    const std::optional<QKeySequence> key =
        equals > 0 && !name.isEmpty() ? keyOf(line.mid(equals + 1).trimmed()) : std::nullopt;
    if (key)
        contents->keys.insert(name, *key);
    else
        ++contents->unreadable;
}

} // namespace

QByteArray SchemeText::write(const QMap<QString, QKeySequence> &keys)
{
    QByteArray text = QByteArray(Header) + '\n';
    for (auto it = keys.cbegin(); it != keys.cend(); ++it) {
        const QString key = it->toString(QKeySequence::PortableText);
        text += escapedName(it.key()) + '=' + (key.isEmpty() ? QByteArray() : escapedValue(key)) + '\n';
    }
    return text;
}

SchemeText::Contents SchemeText::read(const QByteArray &text)
{
    Contents contents;
    bool isInside = false;
    const QList<QByteArray> lines = text.mid(text.startsWith("\xef\xbb\xbf") ? 3 : 0).split('\n');
    for (const QByteArray &bytes : lines) {
        const QByteArray line = bytes.trimmed();
        if (line.startsWith('[')) {
            isInside = line == Header;
            contents.hasGroup = contents.hasGroup || isInside;
        } else if (isInside && !line.isEmpty() && !line.startsWith(';') && !line.startsWith('#')) {
            readLine(line, &contents);
        }
    }
    return contents;
}
