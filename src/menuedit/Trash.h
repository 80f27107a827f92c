// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>

/**
 * The desktop's trash, where what it holds keeps a note of where it was.
 */
namespace Trash {

/// Moves what is at \a path into a trash; returns the path that it has there, empty where none can be had.
/// A link is put there itself, wherever it leads.
QString put(const QString &path);

/// Removes the note of what was at \a place and has been moved out of the trash.
void forget(const QString &place);

} // namespace Trash
