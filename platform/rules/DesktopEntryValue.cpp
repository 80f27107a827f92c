// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "DesktopEntryValue.h"

#include <cstdint>
#include <cstring>

namespace {

// Length of the sequence that a lead byte announces; 0 for a byte that cannot lead.
int sequenceLength(unsigned char lead)
{
    if (lead < 0x80)
        return 1;
    if (lead < 0xC2)
        return 0;
    if (lead < 0xE0)
        return 2;
    if (lead < 0xF0)
        return 3;
    return lead < 0xF5 ? 4 : 0;
}

// One code point of more than one byte; 0 if it is cut off, overlong, a surrogate or too large.
char32_t decodeSequence(const unsigned char *bytes, int length)
{
    char32_t code = bytes[0] & (0x7FU >> length);
    for (int i = 1; i < length; ++i) {
        if ((bytes[i] & 0xC0) != 0x80)
            return 0;
        code = (code << 6) | (bytes[i] & 0x3FU);
    }
    const bool overlong = (length == 3 && code < 0x800) || (length == 4 && code < 0x10000);
    const bool surrogate = code >= 0xD800 && code < 0xE000;
    return overlong || surrogate || code > 0x10FFFF ? 0 : code;
}

char unescaped(char escape)
{
    switch (escape) {
    case 's':
        return ' ';
    case 'n':
        return '\n';
    case 't':
        return '\t';
    case 'r':
        return '\r';
    case '\\':
        return '\\';
    default:
        return 0;
    }
}

bool hasEscape(std::string_view bytes)
{
    return !bytes.empty() && std::memchr(bytes.data(), '\\', bytes.size());
}

bool isAscii(std::string_view bytes)
{
    constexpr std::uint64_t HighBits = 0x8080808080808080U;
    std::uint64_t block = 0;
    std::size_t i = 0;
    for (; i + sizeof block <= bytes.size(); i += sizeof block) {
        std::memcpy(&block, bytes.data() + i, sizeof block);
        if (block & HighBits)
            return false;
    }
    block = 0;
    for (; i < bytes.size(); ++i)
        block |= static_cast<unsigned char>(bytes[i]);
    return !(block & HighBits);
}

void appendEscaped(std::string &out, const QString &text, bool first, bool inList)
{
    const QByteArray bytes = text.toUtf8();
    out.reserve(out.size() + std::size_t(bytes.size()) + 1);
    for (int i = 0; i < bytes.size(); ++i) {
        const char c = bytes.at(i);
        if (c == '\\')
            out += "\\\\";
        else if (c == '\n')
            out += "\\n";
        else if (c == '\r')
            out += "\\r";
        else if (c == '\t')
            out += "\\t";
        else if (c == ' ' && i == 0 && first)
            out += "\\s";
        else if (c == ';' && inList)
            out += "\\;";
        else
            out += c;
    }
}

} // namespace

std::optional<QString> DesktopEntryValue::decodeUtf8(std::string_view bytes)
{
    if (isAscii(bytes))
        return QString::fromLatin1(bytes.data(), int(bytes.size()));
    // A result never has more units than the source has bytes.
    QString text(int(bytes.size()), Qt::Uninitialized);
    auto *out = reinterpret_cast<ushort *>(text.data());
    const ushort *const begin = out;
    const auto *in = reinterpret_cast<const unsigned char *>(bytes.data());
    const auto *const end = in + bytes.size();
    while (in < end) {
        if (*in < 0x80) {
            *out++ = *in++;
            continue;
        }
        const int length = sequenceLength(*in);
        if (length < 2 || end - in < length)
            return std::nullopt;
        const char32_t code = decodeSequence(in, length);
        if (!code)
            return std::nullopt;
        if (code >= 0x10000) {
            *out++ = QChar::highSurrogate(code);
            *out++ = QChar::lowSurrogate(code);
        } else {
            *out++ = ushort(code);
        }
        in += length;
    }
    text.truncate(int(out - begin));
    return text;
}

std::optional<QString> DesktopEntryValue::toText(std::string_view bytes)
{
    if (!hasEscape(bytes))
        return decodeUtf8(bytes);
    std::string plain;
    plain.reserve(bytes.size());
    for (std::size_t i = 0; i < bytes.size(); ++i) {
        const char meant = bytes[i] == '\\' && i + 1 < bytes.size() ? unescaped(bytes[i + 1]) : '\0';
        if (meant) {
            plain += meant;
            ++i;
        } else {
            plain += bytes[i];
        }
    }
    return decodeUtf8(plain);
}

std::optional<QStringList> DesktopEntryValue::toList(std::string_view bytes)
{
    QStringList items;
    std::string item;
    bool valid = true;
    const auto finish = [&] {
        if (item.empty())
            return;
        const auto text = decodeUtf8(item);
        valid = valid && text;
        if (text)
            items.append(*text);
        item.clear();
    };
    for (std::size_t i = 0; i < bytes.size() && valid; ++i) {
        const char next = bytes[i] == '\\' && i + 1 < bytes.size() ? bytes[i + 1] : '\0';
        const char meant = next == ';' ? ';' : unescaped(next);
        if (meant) {
            item += meant;
            ++i;
        } else if (bytes[i] == ';') {
            finish();
        } else {
            item += bytes[i];
        }
    }
    finish();
    if (!valid)
        return std::nullopt;
    return items;
}

bool DesktopEntryValue::toFlag(std::string_view bytes)
{
    while (!bytes.empty() && (bytes.back() == ' ' || bytes.back() == '\t'))
        bytes.remove_suffix(1);
    return bytes == "true" || bytes == "1";
}

std::string DesktopEntryValue::fromText(const QString &text)
{
    std::string bytes;
    appendEscaped(bytes, text, true, false);
    return bytes;
}

std::string DesktopEntryValue::fromList(const QStringList &items)
{
    std::string bytes;
    for (const QString &item : items) {
        if (item.isEmpty())
            continue;
        appendEscaped(bytes, item, bytes.empty(), true);
        bytes += ';';
    }
    return bytes;
}
