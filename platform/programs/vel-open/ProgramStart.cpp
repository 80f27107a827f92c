// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ProgramStart.h"

#include <QDir>
#include <QFileInfo>
#include <QProcess>
#include <QStandardPaths>

namespace {

constexpr int OpeningTime = 1100; // milliseconds; a browser that stays in front takes longer

void takeOffStreams(QProcess *process)
{
    process->setStandardInputFile(QProcess::nullDevice());
    process->setStandardOutputFile(QProcess::nullDevice());
    process->setStandardErrorFile(QProcess::nullDevice());
}

} // namespace

QString startProgram(const QStringList &words, const QString &folder)
{
    if (!folder.isEmpty() && !QFileInfo(folder).isDir())
        return QStringLiteral("the folder %1 does not exist").arg(folder);
    QString problem = whyNotExecutable(words.first(), folder);
    if (!problem.isEmpty())
        return problem;

    QProcess process;
    takeOffStreams(&process);
    process.setProgram(words.first());
    process.setArguments(words.mid(1));
    process.setWorkingDirectory(folder);
    if (process.startDetached())
        return {};
    return QStringLiteral("cannot start %1: %2").arg(words.first(), process.errorString());
}

QString whyNotExecutable(const QString &program, const QString &folder)
{
    if (!program.contains(QLatin1Char('/'))) {
        if (QStandardPaths::findExecutable(program).isEmpty())
            return QStringLiteral("there is no program %1").arg(program);
        return {};
    }
    const QFileInfo file(QDir(folder.isEmpty() ? QDir::currentPath() : folder), program);
    if (!file.exists())
        return QStringLiteral("there is no program %1").arg(program);
    if (!file.isFile() || !file.isExecutable())
        return QStringLiteral("%1 is not executable").arg(program);
    return {};
}

QString openWithDesktop(const QString &target)
{
    // Its destruction would end the program, and it may well be the browser itself that runs:
    // it goes with this process, which leaves it alone.
    auto *process = new QProcess;
    takeOffStreams(process);
    process->start(QStringLiteral("xdg-open"), {target});
    if (!process->waitForStarted())
        return QStringLiteral("cannot start xdg-open: %1").arg(process->errorString());
    if (!process->waitForFinished(OpeningTime))
        return {};
    if (process->exitStatus() == QProcess::NormalExit && process->exitCode() == 0)
        return {};
    return QStringLiteral("nothing opens %1").arg(target);
}
