// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>
#include <QStringList>
#include <QVector>

class FileProgress;

/**
 * Copying and moving of files and folders into a directory. All or nothing: when one item
 * fails, those already done are taken back. Nothing is ever overwritten, and an item appears
 * under its name only when it is there completely; what has to be copied appears together. Shows nothing; the
 * caller tells the user.
 */
namespace FileTransfer {

enum class Action { Copy, Move };

enum class Failure {
    None,
    SourceGone, ///< There is no such file, or it is not a local one.
    TargetExists, ///< The directory has something of that name; or two items have the same.
    IntoItself, ///< A folder was to be put into itself or below itself.
    NotWritable, ///< The directory does not exist or may not be written.
    Canceled, ///< Whoever followed did not want to go on.
    Failed ///< Anything else; see Result::reason.
};

struct Result
{
    Failure failure = Failure::None;
    /// The path that it failed for.
    QString path;
    /// What the system said, for Failed.
    QString reason;

    bool succeeded() const { return failure == Failure::None; }
};

/// What goes where.
struct Item
{
    QString source; ///< an absolute path
    QString target; ///< the path that it is to have; where that is its own, it is left alone
};

/// Whether \a source lies directly in \a directory, by whatever path.
bool liesIn(const QString &source, const QString &directory);

/// The \a sources under their own names in \a targetDirectory.
QVector<Item> itemsFor(const QStringList &sources, const QString &targetDirectory);

/// Whether transfer() could begin; touches nothing.
Result check(const QVector<Item> &items);
Result check(const QStringList &sources, const QString &targetDirectory);

/**
 * Copies or moves the \a items, folders with everything in them, across file systems too.
 *
 * Links are remade, not followed, in a folder that is copied. A link given itself is moved so
 * that it still points to the same thing; a copy of a link to a file is a copy of that file.
 */
Result transfer(const QVector<Item> &items, Action action, FileProgress &progress);
/// The same with the \a sources under their own names in \a targetDirectory.
Result transfer(const QStringList &sources, const QString &targetDirectory, Action action,
                FileProgress &progress);
/// The same with nobody following.
Result transfer(const QStringList &sources, const QString &targetDirectory, Action action);

} // namespace FileTransfer
