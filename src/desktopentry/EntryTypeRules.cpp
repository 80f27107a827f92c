// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EntryTypeRules.h"

#include <frame/EntryPath.h>

bool EntryTypeRules::isShown(ShownFor row, const QString &type)
{
    switch (row) {
    case ShownFor::Applications:
        return type == Application;
    case ShownFor::Links:
        return type == Link;
    case ShownFor::All:
        break;
    }
    return true;
}

QStringList EntryTypeRules::choices(const QStringList &allowed)
{
    return allowed.isEmpty() ? QStringList{Application, Link, Directory} : allowed;
}

bool EntryTypeRules::hasChoice(const QString &type, const QStringList &choices)
{
    return choices.size() > 1 || type != Directory;
}

EntryTypeRules::NewEntry EntryTypeRules::newEntryAt(const QString &path)
{
    if (EntryPath::isRecordFile(path))
        return {Directory, {Directory}};
    if (EntryPath::isEntry(path))
        return {Application, {Application, Link}};
    return {};
}
