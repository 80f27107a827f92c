// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "EntryExecution.h"

/**
 * Showing of files where they lie, in the desktop's file manager.
 */
namespace ContainingFolder {

/**
 * Has the file manager that is on the session bus, or is started by it, show the file at \a path in its
 * folder. Where there is none, the desktop's program for entries opens the folder.
 *
 * Nothing is waited for.
 *
 * @param owner for as long as it lives the outcome is followed
 * @param path absolute
 * @param failed is told when neither way works
 */
void show(QWidget *owner, const QString &path, const EntryExecution::Failed &failed);

} // namespace ContainingFolder
