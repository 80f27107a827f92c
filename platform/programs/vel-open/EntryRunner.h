// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>

/**
 * Runs a desktop entry, or opens any other file or folder.
 *
 * @param path the file; relative to the current folder when it is not absolute
 * @return why that did not work; empty when it did
 */
QString runEntry(const QString &path);
