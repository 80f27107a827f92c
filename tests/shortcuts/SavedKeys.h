// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QKeySequence>
#include <QString>
#include <QStringList>
#include <QVector>

namespace SavedKeys {

/**
 * Saves keys as an application does, loads them as the application does after a restart, and tells
 * which are not what they were.
 *
 * \param keys a key each for an action of its own
 * \param path the settings file, which does not exist yet
 * \return each key that was lost, and what was loaded instead
 */
QStringList lostOf(const QVector<QKeySequence> &keys, const QString &path);

} // namespace SavedKeys
