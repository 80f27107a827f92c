// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TextChange.h"

namespace {

// A character beyond the first plane is two.
bool isOneCharacter(const QString &text)
{
    return text.size() == 1 || (text.size() == 2 && text.at(0).isHighSurrogate());
}

} // namespace

TextChange::TextChange(const QString &before, const QString &after)
    : m_position(0)
{
    const int shorter = qMin(before.size(), after.size());
    while (m_position < shorter && before.at(m_position) == after.at(m_position))
        ++m_position;
    int behind = 0;
    while (behind < shorter - m_position
           && before.at(before.size() - 1 - behind) == after.at(after.size() - 1 - behind))
        ++behind;
    m_removed = before.mid(m_position, before.size() - m_position - behind);
    m_inserted = after.mid(m_position, after.size() - m_position - behind);
}

bool TextChange::isTyped() const
{
    return (isOneCharacter(m_inserted) && m_removed.isEmpty())
        || (m_inserted.isEmpty() && isOneCharacter(m_removed));
}

bool TextChange::continues(const TextChange &former) const
{
    if (m_inserted.isEmpty() != former.m_inserted.isEmpty())
        return false;
    // Equal characters side by side hide which of them went or came.
    if (m_inserted.isEmpty())
        return qAbs(m_position - former.m_position) <= m_removed.size();
    const bool startsWord = former.m_inserted.back().isSpace() && !m_inserted.front().isSpace();
    return !startsWord && m_position <= former.end() && m_position >= former.m_position;
}
