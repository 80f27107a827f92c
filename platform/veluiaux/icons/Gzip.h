// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QByteArray>

#include <optional>

/// Data as gzip compresses them.
namespace Gzip {

/// Whether \a bytes begin as compressed data do.
bool isCompressed(const QByteArray &bytes);

/// What \a bytes were before; what there is of it where they are damaged. None when that has more
/// than \a limit bytes.
std::optional<QByteArray> decompressed(const QByteArray &bytes, int limit);

} // namespace Gzip
