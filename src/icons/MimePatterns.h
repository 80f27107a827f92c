// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QByteArray>
#include <QRegularExpression>
#include <QSet>
#include <QString>
#include <QStringList>
#include <QVector>

/**
 * The file name patterns of the MIME database, as far as needed to tell which names the
 * database cannot tell apart.
 *
 * Nearly all patterns are a "*" and the suffix of a name. Two names that no other pattern may
 * match, and that share the longest of these suffixes, match the same patterns; so the database
 * takes them for the same type as long as it does not look at the contents.
 */
class MimePatterns
{
public:
    /**
     * Adds the patterns of a "mime.cache" file as update-mime-database writes it.
     *
     * @return false when the bytes cannot be understood; the patterns are unusable then
     */
    bool addCache(const QByteArray &cache);

    /// To be called when all caches were added, before decidingSuffix().
    void finish();

    /**
     * The length of the suffix of \a name that decides which patterns match it.
     *
     * @return at least 1, less than the length of \a name; 0 when no pattern matches, or one
     *         that is not of the plain kind may match
     */
    int decidingSuffix(const QString &name) const;

private:
    struct Node
    {
        QChar character;
        int firstChild = -1;
        int nextSibling = -1;
        bool isSuffix = false; // a pattern begins here
    };

    // What every name has that a pattern of another kind matches, and that is cheap to look for:
    // one of the last characters, else the begin, else the part in the middle. What is empty
    // tells nothing.
    struct Trait
    {
        QString lastCharacters;
        QString begin;
        QString part;

        bool isOf(const QString &name) const;
    };

    void addPattern(const QString &pattern);
    static Trait traitOf(const QString &pattern);
    bool hasTraitOfOther(const QString &name) const;
    void addSuffix(const QString &suffix);
    int childOf(int node, QChar character) const;
    bool mayMatchOtherPattern(const QString &name) const;

    QVector<Node> m_nodes{Node()}; // the suffixes, read backwards, in lower case
    QSet<QString> m_literals; // in lower case
    QStringList m_otherPatterns;
    QVector<Trait> m_otherTraits; // in lower case
    QRegularExpression m_other;
};
