// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QKeySequence>
#include <QStringList>

namespace StandardKeyNames {

/**
 * What a key does as a standard key of the platform, translated.
 *
 * @param key one whole key
 * @return the names of all that it does there; empty when it is no standard key
 */
QStringList of(const QKeySequence &key);

} // namespace StandardKeyNames
