// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "KeySymbols.h"

#include <frame/QtMajor.h>

#include <QHash>

#include <KKeyServer>

// Last: the macros of Xlib's headers hide names of Qt.
#include <X11/X.h>
#include <X11/XF86keysym.h>
#include <X11/keysym.h>

namespace {

struct Modifier
{
    unsigned int mask;
    Qt::KeyboardModifier modifier;
};

constexpr Modifier UsualModifiers[] = {{ControlMask, Qt::ControlModifier},
                                       {ShiftMask, Qt::ShiftModifier},
                                       {Mod1Mask, Qt::AltModifier},
                                       {Mod4Mask, Qt::MetaModifier}};

constexpr unsigned int FirstOfFunctionKeys = 0x3000; // below, symbols are characters
constexpr unsigned int FirstOfKeypad = 0xff80;
constexpr unsigned int LastOfKeypad = 0xffbf;

using Keys = QHash<unsigned int, int>; // by symbol

#if QT_VERSION_MAJOR >= 6
// A modifier is no key by itself; KDE Frameworks 6 has symbols for some.
bool isModifier(int code)
{
    const int key = code & ~int(Qt::KeyboardModifierMask);
    return key >= Qt::Key_Shift && key <= Qt::Key_Alt;
}

// The one first that keyboards have: KDE Frameworks 6 has a misspelled one for a calculator before it.
QList<int> symbolsOfKey(int code)
{
    if (isModifier(code))
        return {};
    QList<int> symbols = KKeyServer::keyQtToSymXs(code);
    const auto calculator = symbols.indexOf(XF86XK_Calculator);
    if (calculator > 0)
        symbols.move(calculator, 0);
    return symbols;
}

bool keyOfSymbol(unsigned int symbol, int *key)
{
    return KKeyServer::symXModXToKeyQt(symbol, 0, key) && !isModifier(*key);
}
#else
QList<int> symbolsOfKey(int code)
{
    int symbol = 0;
    return KKeyServer::keyQtToSymX(code, &symbol) ? QList<int>{symbol} : QList<int>();
}

bool keyOfSymbol(unsigned int symbol, int *key)
{
    return KKeyServer::symXModXToKeyQt(symbol, 0, key);
}
#endif

void addKey(int code, Keys *keys)
{
    const QList<int> symbols = symbolsOfKey(code);
    for (const int symbol : symbols) {
        if (unsigned(symbol) >= FirstOfFunctionKeys && !keys->contains(unsigned(symbol)))
            keys->insert(unsigned(symbol), code);
    }
}

void addKeyOfKeypad(int key, Keys *keys)
{
    const int code = key | int(Qt::KeypadModifier);
    const QList<int> symbols = symbolsOfKey(code);
    for (const int symbol : symbols) {
        if (unsigned(symbol) >= FirstOfKeypad && unsigned(symbol) <= LastOfKeypad)
            keys->insert(unsigned(symbol), code);
    }
}

// The way back from what needs no X server.
Keys allKeys()
{
    Keys keys = {{XK_KP_Equal, Qt::Key_Equal}, {XF86XK_Clear, Qt::Key_Clear}};
    for (int key = Qt::Key_Escape; key <= Qt::Key_Redo; ++key)
        addKey(key, &keys);
    addKey(Qt::Key_Select, &keys);
    addKey(Qt::Key_Sleep, &keys);
    for (int key = Qt::Key_Space; key <= Qt::Key_AsciiTilde; ++key)
        addKeyOfKeypad(key, &keys);
    for (int key = Qt::Key_Escape; key <= Qt::Key_F35; ++key)
        addKeyOfKeypad(key, &keys);
    return keys;
}

std::optional<int> usualKeyOf(unsigned int symbol)
{
    if (symbol < FirstOfFunctionKeys) {
        const bool isLowerCase = symbol >= XK_a && symbol <= XK_z;
        return int(isLowerCase ? symbol - XK_a + XK_A : symbol);
    }
    static const Keys keys = allKeys();
    const auto key = keys.constFind(symbol);
    return key == keys.constEnd() ? std::nullopt : std::optional<int>(*key);
}

bool maskOf(int code, unsigned int *mask)
{
    if (QtMajor::x11Display())
        return KKeyServer::keyQtToModX(code, mask);
    for (const Modifier &each : UsualModifiers) {
        if (code & each.modifier)
            *mask |= each.mask;
    }
    return true;
}

} // namespace

std::optional<KeySymbols::Symbol> KeySymbols::ofKey(int code)
{
    const QList<int> symbols = symbolsOfKey(code);
    Symbol symbol;
    if (symbols.isEmpty() || !maskOf(code, &symbol.mask))
        return std::nullopt;
    symbol.symbol = symbols.first();
    return symbol;
}

std::optional<int> KeySymbols::keyOf(unsigned int symbol)
{
    if (!QtMajor::x11Display())
        return usualKeyOf(symbol);
    int key = 0;
    return keyOfSymbol(symbol, &key) ? std::optional<int>(key) : std::nullopt;
}

int KeySymbols::modifiersOf(unsigned int mask)
{
    int modifiers = 0;
    if (QtMajor::x11Display())
        KKeyServer::modXToQt(mask, &modifiers);
    else
        for (const Modifier &each : UsualModifiers)
            modifiers |= mask & each.mask ? int(each.modifier) : 0;
    return modifiers;
}
