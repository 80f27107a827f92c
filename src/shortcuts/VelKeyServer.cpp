// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "VelKeyServer.h"

#include "GlobalShortcuts.h"
#include "KeyNames.h"

QString VelKeyServer::KeyQtToKeyStringX(int code)
{
    return KeyNames::toKeyString(code);
}

QString VelKeyServer::KeyStringXToQt(const QString &text)
{
    return KeyNames::fromKeyString(text);
}

QString VelKeyServer::checkForGlobalShortcut(const QKeySequence &sequence)
{
    return GlobalShortcuts::find(GlobalShortcuts::filePath(), sequence);
}
