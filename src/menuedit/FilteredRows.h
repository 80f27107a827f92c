// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QSet>
#include <QString>

/**
 * The items of a menu that a filter lets through, by their paths.
 */
class FilteredRows
{
public:
    /// Lets an item through that matches, and the folders below \a menuDirectory that lead to it.
    /// Of a folder that matches everything is let through that it holds.
    void add(const QString &menuDirectory, const QString &path, bool isFolder);
    /// Lets the same through as \a other besides.
    void unite(const FilteredRows &other);

    bool contains(const QString &path) const;
    /// Whether \a path itself matches.
    bool isMatch(const QString &path) const { return m_matches.contains(path); }
    bool isEmpty() const { return m_matches.isEmpty(); }
    /// How many items match.
    int count() const { return m_matches.size(); }
    /// The folders that have to be open for every match to be seen.
    const QSet<QString> &foldersToOpen() const { return m_toOpen; }

    bool operator==(const FilteredRows &other) const;

private:
    QSet<QString> m_matches;
    QSet<QString> m_toOpen;
    QSet<QString> m_folders; // those of the matches that are folders
};
