// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "KeyNames.h"

#include <QKeySequence>

#include <KKeyServer>

#include <X11/Xlib.h>

#include <array>

namespace {

struct Modifier
{
    const char *name;
    unsigned int bit;
};

constexpr std::array<Modifier, 6> acceptedModifiers = {
    {{"Ctrl", 0x04}, {"Control", 0x04}, {"Shift", 0x01}, {"Alt", 0x08}, {"Meta", 0x40}, {"Mod4", 0x40}}};

unsigned int modifierBit(const char *name, int length)
{
    for (const Modifier &modifier : acceptedModifiers) {
        if (length == int(qstrlen(modifier.name)) && qstrnicmp(name, modifier.name, uint(length)) == 0)
            return modifier.bit;
    }
    return 0;
}

// Deprecated because other layouts need the modifiers too; a key string is independent of the
// layout, it names the key symbol.
bool keyFromSymbol(unsigned int symbol, int *key)
{
    QT_WARNING_PUSH
    QT_WARNING_DISABLE_DEPRECATED
    return KKeyServer::symXToKeyQt(symbol, key);
    QT_WARNING_POP
}

} // namespace

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
        mask |= modifierBit(keyString.constData() + begin, end - begin);
        begin = end + 1;
    }
    int key = 0;
    if (!keyFromSymbol(static_cast<unsigned int>(symbol), &key))
        return std::nullopt;
    return key | qtModifiers(mask);
}

int KeyNames::qtModifiers(unsigned int mask)
{
    int modifiers = 0;
    KKeyServer::modXToQt(mask, &modifiers);
    return modifiers;
}

QString KeyNames::portableText(int code)
{
    return QKeySequence(code).toString(QKeySequence::PortableText);
}

bool KeyNames::readsBackUnchanged(int code)
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
