// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "FolderWatch.h"

#include <functional>
#include <string>

/**
 * Updates a start menu whenever applications came, went or changed, until the program is told to end.
 *
 * An update waits until nothing has happened for a moment, for packages come in many files, but no
 * longer than a second after the first of it.
 */
class MenuWatch
{
public:
    /// Updates the menu by its files.
    using Update = std::function<void()>;

    explicit MenuWatch(Update update);

    /// Goes on until SIGTERM, SIGINT or SIGHUP; false when nothing can be watched.
    bool run();

private:
    enum class News { None, Some, End };

    bool watch();
    News wait(int milliseconds);
    bool collect();

    Update m_update;
    FolderWatch m_folders;
    int m_signals = -1;
};
