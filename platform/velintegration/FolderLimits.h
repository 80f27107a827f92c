// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <cstddef>
#include <cstdio>

/**
 * How far a walk goes that follows links to folders: with two of them in each, a few folders are a
 * tree without end.
 */
class FolderLimits
{
public:
    static constexpr std::size_t MostLevels = 32;
    static constexpr int MostItems = 20000;

    /// Counts an item that lies in \a levels folders; whether the walk may take it. Says once on
    /// standard error that it may not, with \a what is being walked over.
    bool take(std::size_t levels, const char *what)
    {
        if (levels <= MostLevels && m_items < MostItems) {
            ++m_items;
            return true;
        }
        if (!m_told)
            std::fprintf(stderr, "The %s has more than %d items or %zu levels of folders.\n", what, MostItems,
                         MostLevels);
        m_told = true;
        return false;
    }

private:
    int m_items = 0;
    bool m_told = false;
};
