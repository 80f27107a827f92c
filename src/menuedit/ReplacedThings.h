// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>

#include <memory>
#include <vector>

class KeptThing;

/**
 * Files and folders that made room for others. They come back when this goes, unless somebody
 * took them.
 */
class ReplacedThings
{
public:
    /// One of them; it was at \a path.
    struct Thing
    {
        QString path;
        std::unique_ptr<KeptThing> kept;
    };

    ReplacedThings();
    ~ReplacedThings();
    ReplacedThings(const ReplacedThings &) = delete;
    ReplacedThings &operator=(const ReplacedThings &) = delete;

    /// Puts what is at \a path into the trash, or where none can be had out of sight beside its place;
    /// whether that could be done.
    bool putAway(const QString &path);
    /// Hands all of them over.
    std::vector<Thing> take();

private:
    std::vector<Thing> m_things;
};
