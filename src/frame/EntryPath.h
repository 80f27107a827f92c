// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>

/**
 * What a path says about the file that it names; looks at no file.
 *
 * A menu directory consists of entries and folders. What a menu shows for a folder stands in the
 * folder's record file.
 */
namespace EntryPath {

/// Whether \a path is that of an entry: its name ends in ".desktop".
bool isEntry(const QString &path);

/// The file name of an entry that is called \a stem.
QString entryNamed(const QString &stem);

/// A file name without the end that makes it that of an entry.
QString stemOf(const QString &fileName);

/// Whether \a path is that of the record file of a folder.
bool isRecordFile(const QString &path);

/// The path of the record file of \a folder, whether or not there is one.
QString recordFileOf(const QString &folder);

/// The folder that the record file at \a recordFile describes; other paths come back as they are.
QString describedBy(const QString &recordFile);

} // namespace EntryPath
