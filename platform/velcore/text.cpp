// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include <velcore/text.h>

#include <cstddef>

namespace {

int hexadecimalValue(unsigned char c)
{
    if (c >= '0' && c <= '9')
        return c - '0';
    if (c >= 'a' && c <= 'f')
        return c - 'a' + 10;
    if (c >= 'A' && c <= 'F')
        return c - 'A' + 10;
    return -1;
}

// Writes the unescaped bytes; whether there was an escape and none was broken.
bool unescape(const unsigned char *text, unsigned char *out)
{
    bool anyEscape = false;
    while (*text) {
        if (*text != '%') {
            *out++ = *text++;
            continue;
        }
        const int high = hexadecimalValue(text[1]);
        const int low = high < 0 ? -1 : hexadecimalValue(text[2]);
        // A zero byte would cut the zero-terminated result short.
        if (low < 0 || (high == 0 && low == 0))
            return false;
        *out++ = static_cast<unsigned char>(high * 16 + low);
        text += 3;
        anyEscape = true;
    }
    *out = 0;
    return anyEscape;
}

bool isContinuation(unsigned char c)
{
    return (c & 0xC0) == 0x80;
}

// The length of the character that begins at \a text; 0 when it is none. Overlong forms,
// surrogates and what lies behind U+10FFFF are refused by the range of the second byte.
std::size_t characterLength(const unsigned char *text)
{
    const unsigned char first = text[0];
    if (first < 0x80)
        return 1;
    if (first < 0xC2 || first > 0xF4 || !isContinuation(text[1]))
        return 0;
    if (first < 0xE0)
        return 2;
    if ((first == 0xE0 && text[1] < 0xA0) || (first == 0xED && text[1] > 0x9F) || !isContinuation(text[2]))
        return 0;
    if (first < 0xF0)
        return 3;
    if ((first == 0xF0 && text[1] < 0x90) || (first == 0xF4 && text[1] > 0x8F) || !isContinuation(text[3]))
        return 0;
    return 4;
}

bool isUtf8(const unsigned char *text)
{
    while (*text) {
        const std::size_t length = characterLength(text);
        if (length == 0)
            return false;
        text += length;
    }
    return true;
}

} // namespace

bool Vel::isEscapedUtf8(const unsigned char *text, unsigned char *out)
{
    return text && out && unescape(text, out) && isUtf8(out);
}
