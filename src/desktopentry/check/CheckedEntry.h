// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "EntryFinding.h"
#include "EntryLookups.h"
#include "EntryText.h"

#include <frame/DesktopEntryRecord.h>

#include <QString>
#include <QVariant>

/// An entry that is being checked; refers to what the caller has.
struct CheckedEntry
{
    const VelUIDesktopEntry &record;
    const EntryText &text;
    QString path; ///< of the file that it will be
    const EntryLookups &lookups;
};

/// One value of an entry that is being checked, and where the findings about it go.
class CheckedValue
{
public:
    using Severity = EntryFinding::Severity;

    CheckedValue(const EntryText::Group &group, const EntryText::Key &key, EntryFindings *findings);

    const EntryText::Group &group;
    const EntryText::Key &key;
    /// Whether nobody has one so long: to look for a repair of each part would take too long, so none is
    /// offered.
    const bool isLong;

    /// Whether it is one of the entry itself, not of an action.
    bool isMain() const;
    QString text() const { return EntryText::text(key.value); }
    /// The bytes with their escapes, for a sentence.
    QString written() const { return QString::fromUtf8(key.value); }

    void add(EntryProblem problem, Severity severity, const QString &sentence) const;
    /// The same, with a repair that gives the key \a value, where that reaches this line.
    void add(EntryProblem problem, Severity severity, const QString &sentence, const QString &repair,
             const QVariant &value) const;

private:
    bool canBeRepaired() const;
    QString action() const;

    EntryFindings *const m_findings;
};
