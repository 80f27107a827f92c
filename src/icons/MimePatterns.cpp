// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MimePatterns.h"

#include "MimeCacheReader.h"

namespace {

bool hasWildcard(const QString &text)
{
    for (const QChar character : text) {
        if (character == QLatin1Char('*') || character == QLatin1Char('?') || character == QLatin1Char('['))
            return true;
    }
    return false;
}

} // namespace

bool MimePatterns::addCache(const QByteArray &cache)
{
    return MimeCacheReader(cache).visitPatterns([this](const QString &pattern) { addPattern(pattern); });
}

void MimePatterns::addPattern(const QString &pattern)
{
    const QString lower = pattern.toLower();
    const QString end = lower.mid(1);
    if (lower.startsWith(QLatin1Char('*')) && !end.isEmpty() && !hasWildcard(end))
        addEnd(end);
    else if (!hasWildcard(lower))
        m_literals.insert(lower);
    else
        m_otherPatterns.append(QRegularExpression::wildcardToRegularExpression(pattern));
}

void MimePatterns::addEnd(const QString &end)
{
    int node = 0;
    for (int i = end.size() - 1; i >= 0; --i) {
        int child = childOf(node, end.at(i));
        if (child < 0) {
            child = m_nodes.size();
            Node added;
            added.character = end.at(i);
            added.nextSibling = m_nodes.at(node).firstChild;
            m_nodes.append(added);
            m_nodes[node].firstChild = child;
        }
        node = child;
    }
    m_nodes[node].isEnd = true;
}

int MimePatterns::childOf(int node, QChar character) const
{
    int child = m_nodes.at(node).firstChild;
    while (child >= 0 && m_nodes.at(child).character != character)
        child = m_nodes.at(child).nextSibling;
    return child;
}

void MimePatterns::finish()
{
    if (m_otherPatterns.isEmpty())
        return;
    m_other.setPattern(m_otherPatterns.join(QLatin1Char('|')));
    m_other.setPatternOptions(QRegularExpression::CaseInsensitiveOption);
    m_other.optimize();
}

bool MimePatterns::mayMatchOtherPattern(const QString &name) const
{
    if (m_otherPatterns.isEmpty())
        return false;
    if (!m_other.isValid())
        return true;
    const QRegularExpressionMatch match = m_other.match(name);
    return !match.isValid() || match.hasMatch(); // a name that is no valid UTF-16 cannot be told
}

int MimePatterns::decidingEnd(const QString &name) const
{
    const QString lower = name.toLower();
    // A character whose small form is longer than itself: the ends could not be compared.
    if (lower.size() != name.size())
        return 0;
    int length = 0;
    int node = 0;
    for (int i = lower.size() - 1; i >= 0; --i) {
        node = childOf(node, lower.at(i));
        if (node < 0)
            break;
        if (m_nodes.at(node).isEnd)
            length = lower.size() - i;
    }
    if (length == 0 || length == name.size() || m_literals.contains(lower))
        return 0;
    return mayMatchOtherPattern(lower) ? 0 : length;
}
