// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EntryExecution.h"

#include <frame/LibraryPlace.h>
#include <frame/MessageBox.h>

#include <QCoreApplication>
#include <QProcess>
#include <QTemporaryFile>

namespace {

constexpr int StartTime = 2000; // milliseconds

QString program()
{
    return QStringLiteral("vel-open");
}

QStringList argumentsFor(const QString &path)
{
    return {QStringLiteral("--exec"), path};
}

QProcess *makeProcess(QWidget *owner)
{
    auto *process = new QProcess(owner);
    QObject::connect(process, QOverload<int, QProcess::ExitStatus>::of(&QProcess::finished), process,
                     &QObject::deleteLater);
    process->setProcessChannelMode(QProcess::ForwardedChannels);
    process->setStandardInputFile(QProcess::nullDevice());
    return process;
}

// Goes with the process when it could not be started.
bool isStarted(QProcess *process, const QString &path)
{
    process->start(LibraryPlace::program(program()), argumentsFor(path));
    if (process->waitForStarted(StartTime))
        return true;
    delete process;
    return false;
}

// A file, where a pipe would break under what was started, should that go on to write to it.
QTemporaryFile *collectErrors(QProcess *process)
{
    auto *errors = new QTemporaryFile(process);
    if (errors->open()) {
        process->setProcessChannelMode(QProcess::ForwardedOutputChannel);
        process->setStandardErrorFile(errors->fileName());
    }
    return errors;
}

} // namespace

void EntryExecution::start(QWidget *owner, const QString &path)
{
    if (isStarted(makeProcess(owner), path))
        return;
    MessageBox::show(owner, QMessageBox::Warning, QCoreApplication::translate("VelMenuView", "Warning"),
                     QCoreApplication::translate("VelMenuView", "Can't start:\n%1 %2")
                         .arg(program(), argumentsFor(path).join(QLatin1Char(' '))));
}

void EntryExecution::start(QWidget *owner, const QString &path, const Failed &failed)
{
    QProcess *process = makeProcess(owner);
    QTemporaryFile *errors = collectErrors(process);
    QObject::connect(process, QOverload<int, QProcess::ExitStatus>::of(&QProcess::finished), owner,
                     [path, failed, errors](int code, QProcess::ExitStatus status) {
                         if (code == 0 && status == QProcess::NormalExit)
                             return;
                         const QString reason = reasonIn(errors->readAll(), path);
                         failed(!reason.isEmpty() ? reason
                                                  : QCoreApplication::translate(
                                                        "VelMenuView", "the program %1 ended with an error")
                                                        .arg(program()));
                     });
    if (!isStarted(process, path))
        failed(QCoreApplication::translate("VelMenuView", "the program %1 cannot be run").arg(program()));
}

// Others may have written to the same place.
QString EntryExecution::reasonIn(const QByteArray &output, const QString &path)
{
    const QStringList lines = QString::fromLocal8Bit(output).split(QLatin1Char('\n'), Qt::SkipEmptyParts);
    const QString name = program() + QLatin1String(": ");
    for (const QString &line : lines) {
        if (!line.startsWith(name))
            continue;
        const QString reason = line.mid(name.size());
        const QString place = path + QLatin1String(": ");
        return reason.startsWith(place) ? reason.mid(place.size()) : reason;
    }
    return lines.isEmpty() ? QString() : lines.constLast();
}

// Destroying a QProcess would kill what the user has just started.
void EntryExecution::release(QWidget *owner)
{
    const auto processes = owner->findChildren<QProcess *>(QString(), Qt::FindDirectChildrenOnly);
    for (QProcess *process : processes)
        process->setParent(nullptr);
}
