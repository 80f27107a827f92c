// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// What is said of an entry, and what mends it. The first line of an input is the name of the file, the
// rest is the file.

#include "FuzzTarget.h"

#include <desktopentry/check/EntryCheck.h>

#include <algorithm>

namespace {

// Half of the computer is there.
class AnyComputer : public EntryLookups
{
public:
    Answer program(const QString &program, const QString &) const override { return answer(program); }
    Answer icon(const QString &name) const override { return answer(name); }
    Answer file(const QString &path) const override { return answer(path); }
    Answer mimeType(const QString &name) const override { return answer(name); }

private:
    static Answer answer(const QString &question)
    {
        return question.size() % 2 == 0 ? Answer::Yes : Answer::No;
    }
};

bool isSaidIn(const EntryFindings &findings, const EntryFinding &finding)
{
    return std::any_of(findings.cbegin(), findings.cend(), [&finding](const EntryFinding &other) {
        return other.problem == finding.problem && other.key == finding.key && other.group == finding.group
            && other.sentence == finding.sentence;
    });
}

// The lines of \a bytes that are none of the key \a name.
QByteArrayList othersThan(const QString &name, const QByteArray &bytes)
{
    QByteArrayList others;
    for (const QByteArray &line : bytes.split('\n')) {
        if (!line.trimmed().startsWith(name.toUtf8()))
            others.append(line);
    }
    return others;
}

void tryRepair(const EntryFinding &finding, const QByteArray &bytes)
{
    const QString path = Fuzz::write("repaired.desktop", bytes);
    VelUIDesktopEntry record(path);
    finding.repair->applyTo(&record);
    Fuzz::require(record.save(), "what is mended can be saved");
    const QByteArray mended = Fuzz::read(path);
    Fuzz::require(mended != bytes, "a repair changes something");
    const QByteArray ended = bytes.endsWith('\n') ? bytes : bytes + '\n';
    Fuzz::require(othersThan(finding.key, mended) == othersThan(finding.key, bytes)
                      || othersThan(finding.key, mended) == othersThan(finding.key, ended),
                  "a repair changes the lines of one key");
    Fuzz::require(!isSaidIn(EntryCheck::check(record, mended, QString(), AnyComputer()), finding),
                  "what was mended is found no more");
}

} // namespace

void Fuzz::test(const QByteArray &input)
{
    const Parts parts = cut(input);
    const VelUIDesktopEntry record(write("entry.desktop", parts.rest));
    const EntryFindings findings =
        EntryCheck::check(record, parts.rest, QString::fromUtf8(parts.head), AnyComputer());
    for (const EntryFinding &finding : findings) {
        require(!finding.sentence.isEmpty(), "there are words for everything");
        if (finding.repair)
            tryRepair(finding, parts.rest);
    }
}
