// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <functional>

class QByteArray;
class QString;
class QWidget;

/**
 * Running of entries with the desktop's own program for it.
 */
namespace EntryExecution {

/// Hears why an entry was not started: half a sentence.
using Failed = std::function<void(const QString &reason)>;

/// Runs the entry at \a path. Its process is a child of \a owner until it has ended; a message
/// box tells when it cannot be started within two seconds.
void start(QWidget *owner, const QString &path);

/// The same, but \a failed is told instead, for as long as \a owner lives, and also when the program
/// says later why it could not start the entry.
void start(QWidget *owner, const QString &path, const Failed &failed);

/// What the program, whose errors are \a output, gives as the reason that the entry at \a path was not
/// started; empty where it gives none.
QString reasonIn(const QByteArray &output, const QString &path);

/// Lets the processes that \a owner still has live on without it.
void release(QWidget *owner);

} // namespace EntryExecution
