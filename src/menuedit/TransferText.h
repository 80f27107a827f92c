// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "FileTransfer.h"

#include <Qt>

/**
 * What the user is to hear of a transfer of files.
 */
namespace TransferText {

/// Why the files did not come where \a action was to bring them; empty when they did, and when the
/// user ended it.
QString of(const FileTransfer::Result &result, Qt::DropAction action);

} // namespace TransferText
