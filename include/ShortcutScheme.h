// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "veluiextra_export.h"

#include <QKeySequence>
#include <QString>

#include <functional>

class ShortcutsModel;

/**
 * Writes all keys of a ShortcutsModel to a file, and takes the keys of such a file over.
 *
 * The file is an INI file as QSettings writes it: below the header "[Shortcuts]" one line for each
 * name, with the key as QKeySequence::PortableText, or with nothing for no key. So it means the
 * same in every language. A name that stands in several groups of the model has one line; as with
 * ShortcutsModel::saveKeys() the last of these groups counts.
 *
 * \code
 * QString error;
 * if (!ShortcutScheme::save(*model, path, &error))
 *     QMessageBox::critical(this, QString(), error);
 * \endcode
 *
 * The functions keep no state and open no window. They are to be called on the GUI thread.
 *
 * \image html shortcut-schemes.png
 *
 * \since 1.0
 */
namespace ShortcutScheme {

/// What is to happen with a key that somebody else has already.
enum class OnClash {
    Replace, ///< the key is taken over, and the other shortcut has none any more
    Skip, ///< the shortcut keeps the key that it has
    Cancel ///< nothing at all is taken over
};

/**
 * Decides about one clash.
 *
 * The model has not been changed yet when it is called. It may open a window.
 *
 * @param name the name of the shortcut that is to get the key
 * @param otherName the name of the shortcut of the model that has the key or is to get it, too;
 *                  empty when a global shortcut of the desktop has it, whose name is that which
 *                  VelKeyServer::checkForGlobalShortcut() returns. A global shortcut cannot be
 *                  cleared: Replace is then the same as Skip
 * @param key the key
 */
using Ask = std::function<OnClash(const QString &name, const QString &otherName, const QKeySequence &key)>;

/// What load() has done.
struct Result
{
    bool ok; ///< false when nothing was taken over: the file could not be read, or Cancel
    int taken; ///< for how many names of the file the model now has the key of the file
    int skipped; ///< how many lines of the file were left out, for whatever reason
    /// What went wrong, a whole translated sentence: why the file could not be read or, when ok is
    /// true, that some of its lines could not. Empty when nothing did, and after Cancel.
    QString error;
};

/**
 * Writes the keys that a model shows, pending edits included, to a file.
 *
 * The file is replaced as a whole: when that fails, the old one stays as it was. A key whose text
 * would not read back as that key is left out.
 *
 * @param model the model
 * @param path the file; its folder has to exist. What is there and no regular file is refused
 * @param error receives what went wrong, a whole translated sentence, empty if nothing did; may
 *              be null
 * @return whether the file was written
 */
VELUIEXTRA_EXPORT bool save(const ShortcutsModel &model, const QString &path, QString *error = nullptr);

/**
 * Makes the keys of a file the pending keys of a model; they take effect with
 * ShortcutsModel::commitChanges().
 *
 * Left out and counted are names that the model does not have, lines that cannot be read, and what
 * \a ask decides to skip. A key that the shortcut has already is taken over without a question.
 * Whether keys clash is seen by how things will be: two shortcuts may exchange their keys. Whole
 * keys are compared, not how they begin.
 *
 * @param model the model; not owned. It may be deleted while \a ask is called: then nothing is
 *              taken over
 * @param path a regular file of at most 8 MiB
 * @param ask called for one clash after the other; without it every clash is skipped
 */
VELUIEXTRA_EXPORT Result load(ShortcutsModel *model, const QString &path, const Ask &ask);

} // namespace ShortcutScheme
