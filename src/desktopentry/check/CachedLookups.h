// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "EntryLookups.h"

#include <QHash>
#include <QObject>
#include <QPair>
#include <QString>
#include <QTimer>

#include <functional>

/// Looks at the disk while the user pauses, and keeps the answers.
///
/// A question is answered with what is kept, else with Unknown; then it is looked for after a moment in
/// which nothing else was asked, and known() is emitted. An answer that is older than a few seconds is
/// looked for again in the same way, and given in the meantime.
class CachedLookups : public QObject, public EntryLookups
{
    Q_OBJECT

public:
    explicit CachedLookups(QObject *parent = nullptr);

    Answer program(const QString &program, const QString &folder) const override;
    Answer icon(const QString &name) const override;
    Answer file(const QString &path) const override;
    Answer mimeType(const QString &name) const override;

    /// Drops the questions that wait: whoever checks an entry anew asks again for what it still needs.
    void dropQuestions();

Q_SIGNALS:
    /// There are answers that were not known before, or are others than before.
    void known();

private:
    enum Kind { Program, Icon, File, MimeType };
    using Question = QPair<int, QString>;
    using Look = std::function<bool()>;
    struct Known
    {
        Answer answer;
        qint64 time;
    };

    Answer ask(const Question &question, const Look &look) const;
    void lookUp();

    mutable QHash<Question, Known> m_known;
    mutable QHash<Question, Look> m_waiting;
    mutable QTimer m_pause;
};
