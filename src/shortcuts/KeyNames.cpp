// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "KeyNames.h"

#include "KeySymbols.h"

#include <QKeySequence>

#include <array>

// Last: the macros of Xlib's header hide names of Qt.
#include <X11/Xlib.h>

namespace {

struct Modifier
{
    QLatin1String name; // the one that is written
    QLatin1String alias; // the other one that is read, where there is one
    unsigned int bit;
};

// In the order in which they are written.
constexpr std::array<Modifier, 4> Modifiers = {{{QLatin1String("Ctrl", 4), QLatin1String("Control", 7), 0x04},
                                                {QLatin1String("Shift", 5), QLatin1String("Shift", 5), 0x01},
                                                {QLatin1String("Alt", 3), QLatin1String("Alt", 3), 0x08},
                                                {QLatin1String("Mod4", 4), QLatin1String("Meta", 4), 0x40}}};

constexpr unsigned int allBits()
{
    unsigned int bits = 0;
    for (const Modifier &modifier : Modifiers)
        bits |= modifier.bit;
    return bits;
}
static_assert(allBits() == KeyNames::AllModifiers);

bool equals(QLatin1String known, const char *name, std::size_t length)
{
    return std::size_t(known.size()) == length && qstrnicmp(name, known.data(), uint(length)) == 0;
}

} // namespace

unsigned int KeyNames::modifierBit(const char *name, std::size_t length)
{
    for (const Modifier &modifier : Modifiers) {
        if (equals(modifier.name, name, length) || equals(modifier.alias, name, length))
            return modifier.bit;
    }
    return 0;
}

QString KeyNames::toKeyString(int code)
{
    const std::optional<KeySymbols::Symbol> symbol = KeySymbols::ofKey(code);
    if (!symbol)
        return {};
    const char *symbolName = XKeysymToString(static_cast<KeySym>(symbol->symbol));
    if (!symbolName)
        return QLatin1String("");

    QString text;
    for (const Modifier &modifier : Modifiers) {
        if (symbol->mask & modifier.bit)
            text += modifier.name + QLatin1Char('+');
    }
    return text + QString::fromLocal8Bit(symbolName);
}

QString KeyNames::fromKeyString(const QString &keyString)
{
    const std::optional<int> code = codeFromKeyString(keyString.toLocal8Bit());
    const QString portable = code ? portableText(*code) : QString();
    return portable.isEmpty() ? QString() : portable;
}

std::optional<int> KeyNames::codeFromKeyString(const QByteArray &keyString)
{
    const int keyBegin = keyString.lastIndexOf('+') + 1;
    const char *keyName = keyString.constData() + keyBegin;
    if (*keyName == '#' || qstrncmp(keyName, "Super_", 6) == 0)
        return std::nullopt;
    const KeySym symbol = XStringToKeysym(keyName);
    if (symbol == 0)
        return std::nullopt;

    unsigned int mask = 0;
    for (int begin = 0; begin < keyBegin;) {
        const int end = keyString.indexOf('+', begin);
        mask |= modifierBit(keyString.constData() + begin, std::size_t(end - begin));
        begin = end + 1;
    }
    const std::optional<int> key = KeySymbols::keyOf(static_cast<unsigned int>(symbol));
    return key ? std::optional<int>(*key | KeySymbols::modifiersOf(mask)) : std::nullopt;
}

QString KeyNames::portableText(int code)
{
    return QKeySequence(code).toString(QKeySequence::PortableText);
}

bool KeyNames::roundTrips(int code)
{
    const int key = code & ~int(Qt::KeyboardModifierMask);
    const bool isLowerCase = key >= 'a' && key <= 'z';
    if (key <= Qt::Key_AsciiTilde)
        return key >= Qt::Key_Space && !isLowerCase;
    // The blocks of keys that have names.
    return (key >= Qt::Key_Escape && key <= Qt::Key_Clear) || (key >= Qt::Key_Home && key <= Qt::Key_PageDown)
        || (key >= Qt::Key_F1 && key <= Qt::Key_F35) || (key >= Qt::Key_Back && key <= Qt::Key_Refresh)
        || (key >= Qt::Key_MediaPlay && key <= Qt::Key_MediaTogglePlayPause)
        || (key >= Qt::Key_LaunchMail && key <= Qt::Key_ContrastAdjust) || key == Qt::Key_Menu;
}
