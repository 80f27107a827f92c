// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QStringList>

#include <functional>

class QWidget;

/**
 * Showing of files where they lie, in the desktop's file manager.
 */
namespace ContainingFolder {

/// Hears why a folder was not opened: half a sentence.
using Failed = std::function<void(const QString &folder, const QString &reason)>;

/**
 * Has the file manager that is on the session bus, or is started by it, show the files at \a paths in
 * their folders. Where there is none, the desktop's program for entries opens each folder.
 *
 * Nothing is waited for.
 *
 * @param owner for as long as it lives the outcome is followed
 * @param paths absolute
 * @param failed is told of each folder that neither way opens
 */
void show(QWidget *owner, const QStringList &paths, const Failed &failed);

} // namespace ContainingFolder
