// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>

/**
 * Asks the application of a desktop entry over the session bus to show itself, as the standard
 * says for entries with DBusActivatable=true. The bus starts it when it does not run.
 *
 * @param path the entry's file, whose name is the application's on the bus
 * @return whether the application answered or is being started; false when there is no session
 *         bus or nobody of that name
 */
bool activateOnBus(const QString &path);
