// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "FileProgress.h"
#include "TreeCopy.h"

#include <QString>

/**
 * Moving of files, links and folders that leaves them exactly as they are: a link keeps its text, wherever
 * that leads from the new place.
 */
namespace ExactMove {

/// The path as the file system knows it.
TreeCopy::Path native(const QString &path);

/// Moves what is at \a from to \a to, to another file system too; errc::file_exists where
/// something is.
std::error_code move(const TreeCopy::Path &from, const TreeCopy::Path &to, FileProgress &progress);

/// Has what is at \a one and at \a other change places in one step.
std::error_code exchange(const TreeCopy::Path &one, const TreeCopy::Path &other);

/// Puts a link with the text \a linkText to \a to in place of the one at \a from.
std::error_code moveLink(const TreeCopy::Path &from, const TreeCopy::Path &to,
                         const TreeCopy::Path &linkText);

} // namespace ExactMove
