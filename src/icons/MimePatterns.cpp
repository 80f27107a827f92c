// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MimePatterns.h"

#include "MimeCacheReader.h"

#include <algorithm>

namespace {

bool isWildcard(QChar character)
{
    return character == QLatin1Char('*') || character == QLatin1Char('?') || character == QLatin1Char('[');
}

bool hasWildcard(const QString &text)
{
    return std::any_of(text.cbegin(), text.cend(), isWildcard);
}

/// The characters that a "[...]" at the end of \a pattern stands for; empty when that is not plain.
QString lastSetOf(const QString &pattern)
{
    const int begin = pattern.lastIndexOf(QLatin1Char('['));
    const QString set = pattern.mid(begin + 1, pattern.size() - begin - 2);
    if (begin < 0 || set.contains(QRegularExpression(QStringLiteral("[^a-z0-9-]|^-|-$|-.?-"))))
        return QString();
    QString characters = set;
    for (int i = 1; i + 1 < set.size(); ++i) {
        for (ushort c = set.at(i - 1).unicode(); set.at(i) == QLatin1Char('-') && c < set.at(i + 1); ++c)
            characters += QChar(c);
    }
    return characters;
}

/// The longest part of \a pattern that stands for itself.
QString longestPartOf(const QString &pattern)
{
    static const QRegularExpression wildcards(QStringLiteral("\\[[^]]*\\]|[*?]"));
    static const QRegularExpression odd(QStringLiteral("[][\\\\]"));
    QString longest;
    const QStringList parts = pattern.split(wildcards);
    for (const QString &part : parts) {
        // What is left of an odd set does not stand for itself.
        if (part.size() > longest.size() && !part.contains(odd))
            longest = part;
    }
    return longest;
}

} // namespace

bool MimePatterns::addCache(const QByteArray &cache)
{
    return MimeCacheReader(cache).visitPatterns([this](const QString &pattern) { addPattern(pattern); });
}

void MimePatterns::addPattern(const QString &pattern)
{
    const QString lower = pattern.toLower();
    const QString suffix = lower.mid(1);
    if (lower.startsWith(QLatin1Char('*')) && !suffix.isEmpty() && !hasWildcard(suffix))
        addSuffix(suffix);
    else if (!hasWildcard(lower))
        m_literals.insert(lower);
    else {
        m_otherPatterns.append(QRegularExpression::wildcardToRegularExpression(pattern));
        m_otherTraits.append(traitOf(lower));
    }
}

MimePatterns::Trait MimePatterns::traitOf(const QString &pattern)
{
    const QChar last = pattern.back();
    Trait trait;
    if (last == QLatin1Char(']'))
        trait.lastCharacters = lastSetOf(pattern);
    else if (last != QLatin1Char('*') && last != QLatin1Char('?'))
        trait.lastCharacters = last;
    const auto wildcard = std::find_if(pattern.cbegin(), pattern.cend(), isWildcard);
    trait.begin = pattern.left(int(wildcard - pattern.cbegin()));
    trait.part = longestPartOf(pattern);
    return trait;
}

bool MimePatterns::Trait::isOf(const QString &name) const
{
    if (!lastCharacters.isEmpty())
        return lastCharacters.contains(name.back());
    return begin.isEmpty() ? name.contains(part) : name.startsWith(begin);
}

bool MimePatterns::hasTraitOfOther(const QString &name) const
{
    return std::any_of(m_otherTraits.cbegin(), m_otherTraits.cend(),
                       [&name](const Trait &trait) { return trait.isOf(name); });
}

void MimePatterns::addSuffix(const QString &suffix)
{
    int node = 0;
    for (int i = suffix.size() - 1; i >= 0; --i) {
        int child = childOf(node, suffix.at(i));
        if (child < 0) {
            child = m_nodes.size();
            Node added;
            added.character = suffix.at(i);
            added.nextSibling = m_nodes.at(node).firstChild;
            m_nodes.append(added);
            m_nodes[node].firstChild = child;
        }
        node = child;
    }
    m_nodes[node].isSuffix = true;
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
    const auto isHalf = [](QChar character) { return character.isSurrogate(); };
    if (!hasTraitOfOther(name) && std::none_of(name.cbegin(), name.cend(), isHalf))
        return false;
    const QRegularExpressionMatch match = m_other.match(name);
    return !match.isValid() || match.hasMatch(); // a name that is no valid UTF-16 cannot be told
}

int MimePatterns::decidingSuffix(const QString &name) const
{
    const QString lower = name.toLower();
    // A character whose small form is longer than itself: the suffixes could not be compared.
    if (lower.size() != name.size())
        return 0;
    int length = 0;
    int node = 0;
    for (int i = lower.size() - 1; i >= 0; --i) {
        node = childOf(node, lower.at(i));
        if (node < 0)
            break;
        if (m_nodes.at(node).isSuffix)
            length = lower.size() - i;
    }
    if (length == 0 || length == name.size() || m_literals.contains(lower))
        return 0;
    return mayMatchOtherPattern(lower) ? 0 : length;
}
