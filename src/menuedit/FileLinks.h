// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "FileTransfer.h"

/**
 * Symbolic links to files and folders.
 */
namespace FileLinks {

/// Makes at the target of each of the \a items a link to its source. All or nothing: when one fails,
/// those already made are removed. Nothing is overwritten.
FileTransfer::Result make(const QVector<FileTransfer::Item> &items);

} // namespace FileLinks
