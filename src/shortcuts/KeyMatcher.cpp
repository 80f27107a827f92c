// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "KeyMatcher.h"

#include "KeySequences.h"
#include "KeySymbols.h"
#include "QuotedText.h"

#include <frame/QtMajor.h>

#include <cstring>

namespace {

constexpr int ModifiersButKeypad = int(Qt::KeyboardModifierMask) & ~int(Qt::KeypadModifier);

bool isLetterOrDigit(char character)
{
    return (character >= 'a' && character <= 'z') || (character >= 'A' && character <= 'Z')
        || (character >= '0' && character <= '9');
}

} // namespace

// A file key taken apart where that is simple: only known modifiers and "None" before the key.
struct KeyMatcher::Parts
{
    bool isSimple = false;
    unsigned int mask = 0; // X11 bits
    const char *key = nullptr;
    std::size_t keyLength = 0;

    explicit Parts(std::string_view fileKey)
    {
        const char *text = fileKey.data();
        const char *end = text + fileKey.size();
        if (text != end && *text == '"') {
            ++text;
            end -= end > text ? 1 : 0;
        }
        key = text;
        for (const char *at = text; at != end; ++at) {
            if (*at == ',' || static_cast<unsigned char>(*at) >= 0x80)
                return;
            if (*at != '+' && *at != '|')
                continue;
            const std::size_t length = std::size_t(at - key);
            if (length != 4 || std::memcmp(key, "None", 4) != 0) {
                const unsigned int bit = KeyNames::modifierBit(key, length);
                if (bit == 0)
                    return;
                mask |= bit;
            }
            key = at + 1;
        }
        keyLength = std::size_t(end - key);
        isSimple = keyLength > 0;
    }
};

KeyMatcher::KeyMatcher(const QKeySequence &wanted)
    : m_wanted(wanted)
{
    if (wanted.count() != 1)
        return;
    m_wantedKey = QtMajor::chord(wanted, 0) & ~int(Qt::KeyboardModifierMask);
    for (unsigned int mask = 0; mask <= KeyNames::AllModifiers; ++mask) {
        if ((mask & ~KeyNames::AllModifiers) == 0)
            m_wantedMasks[mask] =
                KeySymbols::modifiersOf(mask) == (QtMajor::chord(wanted, 0) & ModifiersButKeypad);
    }
}

bool KeyMatcher::matches(std::string_view fileKey) const
{
    const Parts parts(fileKey);
    if (parts.isSimple) {
        if (const std::optional<bool> decision = decideByParts(parts))
            return *decision;
        if (const std::optional<bool> decision = decideByCode(parts))
            return *decision;
    }
    return matchesText(fileKey);
}

std::optional<bool> KeyMatcher::decideByParts(const Parts &parts) const
{
    // Without a comma it is one key at most.
    if (m_wanted.count() != 1 || !m_wantedMasks[parts.mask])
        return false;
    const bool isOnKeypad = QtMajor::chord(m_wanted, 0) & int(Qt::KeypadModifier);
    if (parts.keyLength == 1 && isLetterOrDigit(*parts.key))
        return !isOnKeypad && m_wantedKey == (*parts.key >= 'a' ? *parts.key - 'a' + 'A' : *parts.key);
    if (*parts.key == 'F' && (parts.keyLength == 2 || parts.keyLength == 3) && parts.key[1] >= '1'
        && parts.key[1] <= '9') {
        const int first = parts.key[1] - '0';
        if (parts.keyLength == 2)
            return !isOnKeypad && m_wantedKey == Qt::Key_F1 + first - 1;
        const int number = first * 10 + parts.key[2] - '0';
        if (parts.key[2] >= '0' && parts.key[2] <= '9' && number <= 35)
            return !isOnKeypad && m_wantedKey == Qt::Key_F1 + number - 1;
    }
    return std::nullopt;
}

// By the key code, where its text is known to read back as the same one.
std::optional<bool> KeyMatcher::decideByCode(const Parts &parts) const
{
    const std::optional<int> code = KeyNames::codeFromKeyString(QByteArray(parts.key, int(parts.keyLength)));
    if (!code || !KeyNames::roundTrips(*code))
        return std::nullopt;
    return QtMajor::chord(m_wanted, 0) == (*code | KeySymbols::modifiersOf(parts.mask));
}

bool KeyMatcher::matchesText(std::string_view fileKey) const
{
    QString key = QuotedText::withoutQuotes(QString::fromUtf8(fileKey.data(), int(fileKey.size())));
    key.replace(QLatin1Char('|'), QLatin1Char('+'));
    key.remove(QLatin1String("None+"));
    const QString converted = KeyNames::fromKeyString(key);
    const QKeySequence sequence(converted.isEmpty() ? key : converted, QKeySequence::NativeText);
    return KeySequences::isKnown(sequence) && sequence == m_wanted;
}
