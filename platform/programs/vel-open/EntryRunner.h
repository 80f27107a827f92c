// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>

/// Whether the user has said that an entry may be run, whoever it belongs to.
enum class Trust { NotGiven, Given };

/**
 * Runs a desktop entry, or opens any other file or folder.
 *
 * Without the user's trust an entry is refused that belongs neither to the user nor to the
 * superuser, is not executable and lies in no data folder.
 *
 * @param path the file; relative to the current folder when it is not absolute
 * @param trust what the user has said
 * @return why that did not work; empty when it did
 */
QString runEntry(const QString &path, Trust trust);
