// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QByteArray>
#include <QKeySequence>
#include <QMap>
#include <QString>

/**
 * The text of a file of keys: an INI file as QSettings writes it, with one group.
 *
 * QSettings itself would keep the file in its cache, lock it, and lose names with "/" at their
 * ends.
 */
namespace SchemeText {

/// What a text says.
struct Contents
{
    bool hasGroup = false; ///< whether there is a header "[Shortcuts]"
    QMap<QString, QKeySequence> keys; ///< by name; of several lines with one name the last counts
    int unreadable = 0; ///< how many lines of the group make no sense
};

/// The text for some keys, all of which survive saving.
QByteArray write(const QMap<QString, QKeySequence> &keys);

/// Reads a text. Bytes that are not escaped are UTF-8.
Contents read(const QByteArray &text);

} // namespace SchemeText
