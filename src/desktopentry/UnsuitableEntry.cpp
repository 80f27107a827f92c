// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "UnsuitableEntry.h"

#include "EntryTypeRules.h"

#include <frame/Unsuitable.h>

#include <QCoreApplication>

namespace {

class Text
{
    Q_DECLARE_TR_FUNCTIONS(VelDesktopEntryEditDialog)
};

} // namespace

QString UnsuitableEntry::text(VelUIDesktopEntry::SuitableError error)
{
    switch (error) {
    case Unsuitable::NoExec:
        return Text::tr("no executable");
    case Unsuitable::ProgramMissing:
    case Unsuitable::ProgramNotExecutable:
    case Unsuitable::ProgramNotInPath:
        return Text::tr("can't find executable");
    case Unsuitable::TryExecMissing:
    case Unsuitable::TryExecNotInPath:
        return Text::tr("can't find try executable");
    case Unsuitable::UrlMissing:
        return Text::tr("can't find URL");
    default:
        return Text::tr("wrong/incomplete desktop entry");
    }
}

QString UnsuitableEntry::fieldMeant(VelUIDesktopEntry::SuitableError error, const VelUIDesktopEntry &entry)
{
    switch (error) {
    case Unsuitable::TryExecMissing:
    case Unsuitable::TryExecNotInPath:
        return QStringLiteral("TryExec");
    case Unsuitable::UrlMissing:
        return QStringLiteral("URL");
    default:
        break;
    }
    if (!EntryTypeRules::choices({}).contains(entry.getType()))
        return QStringLiteral("Type");
    const bool isCommand = error > 0 || (!entry.getExec().isEmpty() && !entry.getName().isEmpty());
    return isCommand ? QStringLiteral("Exec") : QStringLiteral("Name");
}
