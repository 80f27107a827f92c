// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "NameChecks.h"

#include <QCoreApplication>

namespace {

class Text
{
    Q_DECLARE_TR_FUNCTIONS(EntryCheck)
};

void add(EntryProblem problem, const QString &key, const QString &sentence, EntryFindings *findings)
{
    findings->append(
        {problem, EntryFinding::Hint, QStringLiteral("Desktop Entry"), key, {}, sentence, std::nullopt});
}

// What is typed as the name is not what this user sees.
void checkHidden(const VelUIDesktopEntry &entry, EntryFindings *findings)
{
    const QString local = entry.getLocalName();
    if (!local.isEmpty() && !entry.getName().isEmpty() && local != entry.getName())
        add(EntryProblem::HiddenName, QStringLiteral("Name"),
            Text::tr("In your language the entry is shown as '%1'.").arg(local), findings);
}

void checkSame(const QString &text, const QString &other, const QString &sentence, EntryFindings *findings)
{
    if (!text.isEmpty() && text.compare(other, Qt::CaseInsensitive) == 0)
        add(EntryProblem::SameText, QStringLiteral("Comment"), sentence, findings);
}

} // namespace

void NameChecks::check(const CheckedEntry &entry, EntryFindings *findings)
{
    checkHidden(entry.record, findings);
    const QString comment = entry.record.getComment();
    checkSame(comment, entry.record.getName(), Text::tr("The comment says no more than the name."), findings);
    checkSame(comment, entry.record.getGenericName(),
              Text::tr("The comment says no more than the generic name."), findings);
}
