// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <frame/DesktopEntryRecord.h>

#include <QObject>
#include <QProcess>
#include <QString>

#include <memory>

class QTemporaryDir;

/**
 * Runs an entry that is not saved, through the program that runs saved ones.
 *
 * The entry is written to a file for that alone, which is gone afterwards. The program that the entry
 * starts lives on.
 */
class EntryTrial : public QObject
{
    Q_OBJECT

public:
    struct Result
    {
        enum Outcome { Ended, NotStarted, Stopped };

        Outcome outcome;
        int status; ///< of the program that runs entries, when it ended
        QString error; ///< what it said, or why it could not be started
    };

    explicit EntryTrial(QObject *parent = nullptr);
    /// Stops what is still running.
    ~EntryTrial() override;

    /// Runs \a entry as if it stood in \a path; finished() follows. One that is running is left first.
    void start(const VelUIDesktopEntry &entry, const QString &path);
    bool isRunning() const { return m_process != nullptr; }
    void stop();

Q_SIGNALS:
    void finished(const EntryTrial::Result &result);

private:
    bool write(VelUIDesktopEntry entry, const QString &path);
    void leave();
    void end(Result result);

    QString m_path; ///< where the entry is to stand
    QString m_written; ///< where it stands
    std::unique_ptr<QTemporaryDir> m_folder;
    QProcess *m_process = nullptr;
};
