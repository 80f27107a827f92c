// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EntryTrial.h"

#include <frame/LibraryPlace.h>

#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QTemporaryDir>

#include <utility>

namespace {

bool hasCode(const QString &exec, QChar code)
{
    for (int at = exec.indexOf(QLatin1Char('%')); at >= 0 && at + 1 < exec.size();
         at = exec.indexOf(QLatin1Char('%'), at + 2)) {
        if (exec.at(at + 1) == code)
            return true;
    }
    return false;
}

// The place that the program is told of is that of the entry, not that of the file it is tried with.
void fillInPlace(VelUIDesktopEntry *entry, const QString &path)
{
    if (!hasCode(entry->getExec(), QLatin1Char('k')))
        return;
    const QString name = entry->getLocalName().isEmpty() ? entry->getName() : entry->getLocalName();
    QString command = VelUIDesktopEntry::ExecFormatString(entry->getExec())
                          .appName(name)
                          .icon(entry->getIcon())
                          .desktopFilePath(path);
    if (!command.isEmpty())
        entry->setExec(command.replace(QLatin1Char('%'), QLatin1String("%%")));
}

} // namespace

EntryTrial::EntryTrial(QObject *parent)
    : QObject(parent)
{
}

EntryTrial::~EntryTrial()
{
    leave();
}

void EntryTrial::start(const VelUIDesktopEntry &entry, const QString &path)
{
    leave();
    if (!write(entry, path)) {
        end({Result::NotStarted, 0, tr("The entry could not be written to a temporary file.")});
        return;
    }
    m_process = new QProcess(this);
    connect(m_process, QOverload<int, QProcess::ExitStatus>::of(&QProcess::finished), this,
            [this](int status, QProcess::ExitStatus how) {
                const QString error = QString::fromLocal8Bit(m_process->readAllStandardError()).trimmed();
                end({Result::Ended, how == QProcess::NormalExit ? status : -1, error});
            });
    connect(m_process, &QProcess::errorOccurred, this, [this](QProcess::ProcessError error) {
        if (error == QProcess::FailedToStart)
            end({Result::NotStarted, 0, m_process->errorString()});
    });
    m_process->setStandardInputFile(QProcess::nullDevice());
    m_process->setStandardOutputFile(QProcess::nullDevice());
    m_process->start(LibraryPlace::program(QStringLiteral("vel-open")),
                     {QStringLiteral("--exec"), m_written});
}

void EntryTrial::stop()
{
    if (!m_process)
        return;
    leave();
    end({Result::Stopped, 0, QString()});
}

// The name says which application it is.
bool EntryTrial::write(VelUIDesktopEntry entry, const QString &path)
{
    m_path = path;
    m_folder = std::make_unique<QTemporaryDir>(QDir::tempPath() + QStringLiteral("/vel-try-XXXXXX"));
    if (!m_folder->isValid())
        return false;
    const QString name = QFileInfo(path).fileName();
    m_written = m_folder->filePath(name.isEmpty() ? QStringLiteral("entry.desktop") : name);
    fillInPlace(&entry, path.isEmpty() ? m_written : path);
    QFile file(m_written);
    const QByteArray bytes = entry.contents();
    return file.open(QIODevice::WriteOnly | QIODevice::NewOnly) && file.write(bytes) == bytes.size()
        && file.flush();
}

// Killed, it cannot keep anybody waiting.
void EntryTrial::leave()
{
    if (QProcess *const process = std::exchange(m_process, nullptr)) {
        process->disconnect(this);
        process->kill();
        process->waitForFinished();
        delete process;
    }
    m_folder.reset();
}

void EntryTrial::end(Result result)
{
    if (QProcess *const process = std::exchange(m_process, nullptr)) {
        process->disconnect(this);
        process->deleteLater();
    }
    m_folder.reset();
    if (!m_path.isEmpty())
        result.error.replace(m_written, m_path);
    Q_EMIT finished(result);
}
