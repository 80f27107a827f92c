// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EntryChecks.h"

#include "DesktopEntryNames.h"
#include "EntryDocument.h"
#include "ExecLine.h"
#include "ProgramSearch.h"

#include <LocalFile.h>
#include <WindowManagerCommand.h>

#include <QFile>

#include <cstdlib>

namespace {

namespace Names = DesktopEntryNames;
using EntryChecks::NotDisplayed;
using EntryChecks::Unsuitable;

QString mainText(const EntryDocument &entry, std::string_view key)
{
    return entry.text(Names::MainGroup, key);
}

Unsuitable checkProgram(const QString &exec, const QString &program, const QString &folder)
{
    if (isWindowManagerCommand(exec))
        return EntryChecks::Suitable;
    switch (ProgramSearch::find(program, folder)) {
    case ProgramSearch::Result::Found:
        return EntryChecks::Suitable;
    case ProgramSearch::Result::NotExecutable:
        return EntryChecks::ProgramNotExecutable;
    case ProgramSearch::Result::Missing:
        break;
    }
    return ProgramSearch::isPath(program) ? EntryChecks::ProgramMissing : EntryChecks::ProgramNotInPath;
}

Unsuitable checkTryExec(const QString &program)
{
    if (program.isEmpty() || ProgramSearch::find(program) == ProgramSearch::Result::Found)
        return EntryChecks::Suitable;
    return ProgramSearch::isPath(program) ? EntryChecks::TryExecMissing : EntryChecks::TryExecNotInPath;
}

Unsuitable checkApplication(const EntryDocument &entry)
{
    const QString exec = mainText(entry, Names::Exec);
    if (exec.trimmed().isEmpty()) {
        if (!entry.flag(Names::MainGroup, Names::DBusActivatable))
            return EntryChecks::NoExec;
    } else {
        const auto program = isWindowManagerCommand(exec) ? QString() : ExecLine::program(exec);
        if (!program)
            return EntryChecks::Unusable;
        const Unsuitable reason = checkProgram(exec, *program, mainText(entry, Names::Path));
        if (reason != EntryChecks::Suitable)
            return reason;
    }
    return checkTryExec(mainText(entry, Names::TryExec));
}

Unsuitable checkLink(const EntryDocument &entry)
{
    const QString target = mainText(entry, Names::Url);
    if (target.trimmed().isEmpty())
        return EntryChecks::UrlMissing;
    const QString file = localFile(target);
    return file.isEmpty() || QFile::exists(file) ? EntryChecks::Suitable : EntryChecks::UrlMissing;
}

Unsuitable checkType(const EntryDocument &entry)
{
    const QString type = mainText(entry, Names::Type);
    if (type == QLatin1String("Application"))
        return checkApplication(entry);
    if (type == QLatin1String("Link"))
        return checkLink(entry);
    return type == QLatin1String("Directory") ? EntryChecks::Suitable : EntryChecks::Unusable;
}

QStringList currentDesktops()
{
    const char *const desktops = std::getenv("XDG_CURRENT_DESKTOP");
    const QString names = desktops ? QString::fromLocal8Bit(desktops) : QString();
    const QStringList list = names.split(QLatin1Char(':'), Qt::SkipEmptyParts);
    return list.isEmpty() ? QStringList(QStringLiteral("VEL")) : list;
}

bool isForThisDesktop(const QStringList &onlyShowIn, const QStringList &notShowIn)
{
    if (onlyShowIn.isEmpty() && notShowIn.isEmpty())
        return true;
    for (const QString &desktop : currentDesktops()) {
        if (onlyShowIn.contains(desktop))
            return true;
        if (notShowIn.contains(desktop))
            return false;
    }
    return onlyShowIn.isEmpty();
}

} // namespace

EntryChecks::Unsuitable EntryChecks::suitability(const EntryDocument &entry)
{
    const Unsuitable reason = checkType(entry);
    if (reason != Suitable)
        return reason;
    return mainText(entry, Names::Name).isEmpty() ? Unusable : Suitable;
}

EntryChecks::NotDisplayed EntryChecks::displayability(const EntryDocument &entry)
{
    if (entry.flag(Names::MainGroup, Names::Hidden))
        return IsHidden;
    if (entry.flag(Names::MainGroup, Names::NoDisplay))
        return IsNotForMenus;
    if (!isForThisDesktop(entry.list(Names::MainGroup, Names::OnlyShowIn),
                          entry.list(Names::MainGroup, Names::NotShowIn)))
        return IsForOtherDesktops;
    const QString tryExec = mainText(entry, Names::TryExec);
    return tryExec.isEmpty() || ProgramSearch::find(tryExec) == ProgramSearch::Result::Found ? Displayed
                                                                                             : NotInstalled;
}
