// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EntryExecution.h"

#include <frame/MessageBox.h>

#include <QCoreApplication>
#include <QProcess>

namespace {

constexpr int StartTime = 2000; // milliseconds

} // namespace

void EntryExecution::start(QWidget *owner, const QString &path)
{
    const QString program = QStringLiteral("vel-open");
    const QStringList arguments{QStringLiteral("--exec"), path};
    auto *process = new QProcess(owner);
    QObject::connect(process, QOverload<int, QProcess::ExitStatus>::of(&QProcess::finished), process,
                     &QObject::deleteLater);
    process->setProcessChannelMode(QProcess::ForwardedChannels);
    process->setStandardInputFile(QProcess::nullDevice());
    process->start(program, arguments);
    if (process->waitForStarted(StartTime))
        return;
    delete process;
    MessageBox::show(owner, QMessageBox::Warning, QCoreApplication::translate("VelMenuView", "Warning"),
                     QCoreApplication::translate("VelMenuView", "Can't start:\n%1 %2")
                         .arg(program, arguments.join(QLatin1Char(' '))));
}

// Destroying a QProcess would kill what the user has just started.
void EntryExecution::release(QWidget *owner)
{
    const auto processes = owner->findChildren<QProcess *>(QString(), Qt::FindDirectChildrenOnly);
    for (QProcess *process : processes)
        process->setParent(nullptr);
}
