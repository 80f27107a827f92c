// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "FileText.h"

#include <QByteArray>

#include <cstdint>
#include <optional>

/// Reads desktop entry files from disk; remembers nothing (see SharedTexts).
namespace EntryFile {

/// A larger file is no desktop entry and is not read.
constexpr std::int64_t LargestSize = std::int64_t(1024) * 1024;

/// Reads \a path; none if it is no regular file, is too large or cannot be read.
std::optional<FileText> read(const QByteArray &path);

/// Opens \a path for readOpen(), without waiting for anybody; \a flags are added to those of open().
int open(const QByteArray &path, int flags = 0);
/// Reads an open file.
std::optional<FileText> readOpen(int file);

} // namespace EntryFile
