// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "InheritedKeys.h"

#include "DesktopEntryNames.h"

namespace Names = DesktopEntryNames;

InheritedKeys::InheritedKeys(const Entry &own, const Entry &other)
    : m_own(own)
    , m_other(other)
    , m_isOwnEmpty(own.changes.isEmpty() && own.text.bytes().empty())
{
    if (own.group(Names::MainGroup).value(Names::Actions))
        return;
    const QStringList actions = other.group(Names::MainGroup).list(Names::Actions);
    for (const QString &id : actions)
        m_actionGroups.insert(Names::actionGroup(id.toStdString()));
}

bool InheritedKeys::has(std::string_view group, std::string_view key, std::string_view locale)
{
    // The name of a group is the same view for all of its keys.
    const bool isSameGroup = group.data() == m_group.data() && group.size() == m_group.size();
    if (!isSameGroup || key != m_key)
        turnTo(group, key);
    if (locale.empty())
        return m_hasKey;
    return m_hasLanguages && (m_isOwnEmpty || !m_own.group(group).value(key, locale));
}

void InheritedKeys::turnTo(std::string_view group, std::string_view key)
{
    m_group = group;
    m_key = key;
    const bool isLeftOut = Names::isActionGroup(group) && m_actionGroups.count(std::string(group)) == 0;
    m_hasKey = !isLeftOut && !m_own.group(group).value(key);
    m_hasLanguages = m_hasKey && m_other.group(group).value(key).has_value();
}
