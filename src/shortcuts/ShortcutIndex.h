// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "ShortcutFilter.h"

#include <QHash>
#include <QVector>

class IShortcutObject;
class ShortcutsModel;

/**
 * Finds the rows of a ShortcutsModel that a ShortcutFilter matches.
 *
 * It folds the texts of a row once, and that of its key again when that is another one.
 */
class ShortcutIndex
{
public:
    /// Whether a row is matched, by group and row; a row that shows nothing is not.
    using Matches = QVector<QVector<bool>>;

    /// The rows of \a model that \a filter matches.
    Matches matches(const ShortcutsModel &model, const ShortcutFilter &filter);
    /// Reads the texts of \a count more rows of \a model, if so many were not read yet; false when
    /// none is left.
    bool readSome(const ShortcutsModel &model, int count);
    /// Forgets all texts: rows came or went.
    void clear() { m_groups.clear(); }

private:
    struct Entry
    {
        QString names; // of the shortcut and its group
        QKeySequence key; // the one that the row was made for
        ShortcutFilter::Row row;
        bool isRead = false;
    };

    void begin(const ShortcutsModel &model);
    bool fits(const ShortcutsModel &model) const;
    Entry entryOf(const IShortcutObject &object, const QString &group);
    void setKey(Entry *entry, const IShortcutObject &object);
    QString textOf(const QKeySequence &key);

    // Folded, as they are written in English and in the user's language.
    struct ChordText
    {
        QString portable;
        QString native;
    };

    QHash<int, ChordText> m_chords; // many shortcuts share a few
    QVector<QVector<Entry>> m_groups;
    int m_group = 0; // the one to be read next
    int m_row = 0; // of that group
};
