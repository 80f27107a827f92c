// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "CachedLookups.h"

#include <veluiaux/VelIcon.h>

#include <QDir>
#include <QElapsedTimer>
#include <QFileInfo>
#include <QMap>
#include <QMimeDatabase>
#include <QStandardPaths>

namespace {

constexpr int PauseInMilliseconds = 150;
constexpr qint64 FreshInMilliseconds = 5000;
constexpr int MostAnswers = 2000;

qint64 now()
{
    static const QElapsedTimer clock = [] {
        QElapsedTimer started;
        started.start();
        return started;
    }();
    return clock.elapsed();
}

bool isProgram(const QString &program, const QString &folder)
{
    if (!program.contains(QLatin1Char('/')))
        return !QStandardPaths::findExecutable(program).isEmpty();
    const QFileInfo file(folder.isEmpty() ? QDir() : QDir(folder), program);
    return file.isFile() && file.isExecutable();
}

bool isIcon(const QString &name)
{
    if (name.startsWith(QLatin1Char('/')))
        return QFileInfo(name).isFile();
    return !VelIcon::fromTheme(name, QMap<Qt::Corner, QString>(), QIcon()).isNull();
}

} // namespace

CachedLookups::CachedLookups(QObject *parent)
    : QObject(parent)
{
    m_pause.setSingleShot(true);
    m_pause.setInterval(PauseInMilliseconds);
    connect(&m_pause, &QTimer::timeout, this, &CachedLookups::lookUp);
}

EntryLookups::Answer CachedLookups::program(const QString &program, const QString &folder) const
{
    const bool isRelative = program.contains(QLatin1Char('/')) && !program.startsWith(QLatin1Char('/'));
    const QString place = isRelative ? folder + QLatin1Char('/') : QString();
    return ask({Program, place + program}, [program, folder] { return isProgram(program, folder); });
}

EntryLookups::Answer CachedLookups::icon(const QString &name) const
{
    return ask({Icon, name}, [name] { return isIcon(name); });
}

EntryLookups::Answer CachedLookups::file(const QString &path) const
{
    return ask({File, path}, [path] { return QFileInfo::exists(path); });
}

EntryLookups::Answer CachedLookups::mimeType(const QString &name) const
{
    return ask({MimeType, name}, [name] { return QMimeDatabase().mimeTypeForName(name).isValid(); });
}

void CachedLookups::dropQuestions()
{
    m_waiting.clear();
    m_pause.stop();
}

EntryLookups::Answer CachedLookups::ask(const Question &question, const Look &look) const
{
    const auto found = m_known.constFind(question);
    if (found == m_known.constEnd() || now() - found->time > FreshInMilliseconds) {
        m_waiting.insert(question, look);
        m_pause.start();
    }
    return found == m_known.constEnd() ? Answer::Unknown : found->answer;
}

void CachedLookups::lookUp()
{
    const QHash<Question, Look> questions = m_waiting;
    m_waiting.clear();
    if (m_known.size() > MostAnswers)
        m_known.clear();
    bool isNew = false;
    for (auto question = questions.cbegin(); question != questions.cend(); ++question) {
        const Answer answer = (*question)() ? Answer::Yes : Answer::No;
        const auto before = m_known.constFind(question.key());
        isNew = isNew || before == m_known.constEnd() || before->answer != answer;
        m_known.insert(question.key(), {answer, now()});
    }
    if (isNew)
        Q_EMIT known();
}
