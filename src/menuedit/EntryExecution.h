// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

class QString;
class QWidget;

/**
 * Running of entries with the desktop's own program for it.
 */
namespace EntryExecution {

/// Runs the entry at \a path. Its process is a child of \a owner until it has ended; a message
/// box tells when it cannot be started within two seconds.
void start(QWidget *owner, const QString &path);

/// Lets the processes that \a owner still has live on without it.
void release(QWidget *owner);

} // namespace EntryExecution
