// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "CheckedEntry.h"

namespace {

constexpr int LongestValue = 128 * 1024; // the system passes no longer argument on
constexpr int MostItems = 500;

} // namespace

CheckedValue::CheckedValue(const EntryText::Group &inGroup, const EntryText::Key &ofKey,
                           EntryFindings *findings)
    : group(inGroup)
    , key(ofKey)
    , isLong(ofKey.value.size() > LongestValue || ofKey.value.count(';') > MostItems)
    , m_findings(findings)
{
}

bool CheckedValue::isMain() const
{
    return group.name == "Desktop Entry";
}

void CheckedValue::add(EntryProblem problem, Severity severity, const QString &sentence) const
{
    m_findings->append({problem, severity, QString::fromUtf8(group.name), QString::fromUtf8(key.name),
                        QString::fromUtf8(key.locale), sentence, std::nullopt});
}

void CheckedValue::add(EntryProblem problem, Severity severity, const QString &sentence,
                       const QString &repair, const QVariant &value) const
{
    add(problem, severity, sentence);
    if (canBeRepaired())
        m_findings->last().repair = EntryRepair{repair, QString::fromUtf8(key.name), value, action()};
}

// The id of the action that the value belongs to; empty where it belongs to none.
QString CheckedValue::action() const
{
    const QByteArray prefix = QByteArrayLiteral("Desktop Action ");
    return group.name.startsWith(prefix) ? QString::fromUtf8(group.name.mid(prefix.size())) : QString();
}

// A record changes the last of several lines and leaves the others alone.
bool CheckedValue::canBeRepaired() const
{
    return !isLong && (isMain() || !action().isEmpty()) && group.count == 1 && key.locale.isEmpty()
        && EntryText::count(group, key) == 1;
}
