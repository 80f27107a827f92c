// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>
#include <QStringList>

/**
 * Starts a program in a session of its own that nobody waits for, off the streams of its caller.
 *
 * @param words the program and its arguments; not empty
 * @param folder the folder to start in; empty for the current one
 * @return why it did not start; empty when it runs
 */
QString startProgram(const QStringList &words, const QString &folder);

/// Why \a program cannot be run from \a folder; empty when it can.
QString whyNotExecutable(const QString &program, const QString &folder);

/**
 * Opens a link, a folder or a file with the program that is meant for it.
 *
 * Waits for a moment to learn whether that is known at all.
 *
 * @return why it could not be opened; empty when that is under way
 */
QString openWithDesktop(const QString &target);
