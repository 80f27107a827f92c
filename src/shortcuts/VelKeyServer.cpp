// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "VelKeyServer.h"

#include "GlobalShortcuts.h"
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

// In the order in which they are written.
constexpr std::array<Modifier, 4> modifiers = {
    {{"Ctrl", 0x04}, {"Shift", 0x01}, {"Alt", 0x08}, {"Mod4", 0x40}}};

} // namespace

QString VelKeyServer::KeyQtToKeyStringX(int code)
{
    int symbol = 0;
    unsigned int mask = 0;
    if (!KKeyServer::keyQtToSymX(code, &symbol) || !KKeyServer::keyQtToModX(code, &mask))
        return {};
    const char *symbolName = XKeysymToString(static_cast<KeySym>(symbol));
    if (!symbolName)
        return QLatin1String("");

    QString text;
    for (const Modifier &modifier : modifiers) {
        if (mask & modifier.bit)
            text += QLatin1String(modifier.name) + QLatin1Char('+');
    }
    return text + QString::fromLocal8Bit(symbolName);
}

QString VelKeyServer::KeyStringXToQt(const QString &text)
{
    const std::optional<int> code = KeyNames::codeFromKeyString(text.toLocal8Bit());
    if (!code)
        return {};
    const QString portable = KeyNames::portableText(*code);
    return portable.isEmpty() ? QString() : portable;
}

QString VelKeyServer::checkForGlobalShortcut(const QKeySequence &sequence)
{
    return GlobalShortcuts::find(GlobalShortcuts::filePath(), sequence);
}
