// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QByteArray>
#include <QStringList>
#include <QTemporaryDir>

/**
 * Copies of desktop entries to measure on, all of them old enough for their texts to be shared.
 */
class EntryFiles
{
public:
    static constexpr int MostFiles = 40;

    /// Entries as applications install them, in so many languages, with two actions.
    static QByteArrayList synthetic(int languages);
    /// The entries of the applications that this machine has.
    static QByteArrayList installed();

    /// Writes \a contents in \a sets copies to the file system that holds \a parent.
    EntryFiles(const QString &parent, const QByteArrayList &contents, int sets = 1);

    /// The number of files in a set.
    int count() const { return m_count; }
    /// The usual size of a file in bytes.
    int size() const { return m_size; }

    /// The path of a file in the set that is in use; the same for C.
    const QString &path(int i) const { return m_paths.at(m_first + i % m_count); }
    const QByteArray &encoded(int i) const { return m_encoded.at(m_first + i % m_count); }

    /// From now on the next set is in use.
    void useNextSet();

    /// Waits until all files are old enough, whatever was just done to them.
    static void settle();
    /// Waits until all files are older than a second, as those are that a user edits.
    static void settleForLong();

private:
    void write(const QByteArray &bytes);

    QTemporaryDir m_folder;
    QStringList m_paths;
    QByteArrayList m_encoded;
    int m_count;
    int m_size;
    int m_first = 0;
};
