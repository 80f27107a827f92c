// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "FileIdentity.h"

#include <QCache>
#include <QString>
#include <QStringList>

/**
 * What the items of a menu can be found by: their names, generic names, comments, commands,
 * keywords and file names.
 *
 * A file is read when it is asked for first, and again once it changed. What is kept is bounded; of
 * what was dropped the file is read anew.
 */
class EntryFields
{
public:
    struct Fields
    {
        QString text; ///< folded (see SearchText), the fields apart by line feeds
        QString fileName; ///< folded; the text has it without ".desktop", which they all have
        bool isHidden = false; ///< the menu leaves the item out
    };

    /// Whether all \a words stand in \a fields; those with a dot may stand in the file name.
    static bool match(const Fields &fields, const QStringList &words);

    EntryFields();
    EntryFields(const EntryFields &) = delete;
    EntryFields &operator=(const EntryFields &) = delete;

    /// The fields of the file or folder at \a path as it is now.
    Fields of(const QString &path, bool isFolder);

private:
    struct Known
    {
        FileIdentity identity;
        Fields fields;
    };

    QCache<QString, Known> m_known;
};
