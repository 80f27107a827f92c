// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QByteArray>
#include <QHash>
#include <QString>
#include <QStringList>
#include <QVector>

/// The text of an entry as a strict reader sees it: nothing is passed over in silence.
class EntryText
{
public:
    /// A line "Name[locale]=value".
    struct Key
    {
        QByteArray written; ///< all that stands before the "="
        QByteArray name;
        QByteArray locale;
        QByteArray value; ///< with its escapes
        bool isWellFormed = true; ///< of letters, digits and "-" with a language or without
        /// Whether readers take it for what it would be without its fault: some do not look at the last
        /// character of the language.
        bool isReadable = true;
        bool isRepetition = false; ///< the group has such a line above
    };

    /// All groups of one name.
    struct Group
    {
        QByteArray name;
        int count = 0;
        QVector<Key> keys;
        QHash<QByteArray, QVector<int>> lines; ///< where each key stands among them
    };

    /// A line that cannot be read, or not without a correction.
    struct Fault
    {
        enum Kind { CarriageReturn, Stray, KeyBeforeGroup, LeadingBlank, TrailingBlank };
        Kind kind;
        QByteArray line;
    };

    explicit EntryText(const QByteArray &bytes);

    bool isEmpty() const { return m_isEmpty; }
    const QVector<Fault> &faults() const { return m_faults; }
    /// In the order in which they stand first.
    const QVector<Group> &groups() const { return m_groups; }
    /// The groups of \a name; null when there are none.
    const Group *group(const QByteArray &name) const;
    /// The group of the entry itself; null when there is none.
    const Group *mainGroup() const;

    /// The line of \a name without a language that counts, the last one; null when there is none.
    static const Key *key(const Group &group, const QByteArray &name);
    /// How many lines \a group has for \a key.
    static int count(const Group &group, const Key &key);

    /// The text that the bytes of a value stand for.
    static QString text(const QByteArray &value);
    /// The items of a list, with their escapes; an empty one behind the last ";" does not count.
    static QByteArrayList items(const QByteArray &value);

private:
    void read(QByteArray line);
    bool readGroup(const QByteArray &line);
    bool readKey(const QByteArray &line);
    void add(Key key);

    bool m_isEmpty;
    int m_current = -1;
    QVector<Group> m_groups;
    QHash<QByteArray, int> m_places; ///< of the groups
    QVector<Fault> m_faults;
};
