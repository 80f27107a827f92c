// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <veluiaux/veluiaux_export.h>

#include <QString>

#include <memory>

/**
 * Reads entries before they are asked for.
 *
 * A few threads read the entries of a folder, its record file and the record files of its folders,
 * while whoever shows the folder is still listing it. A VelUIDesktopEntry that is made of one of
 * these files meanwhile takes what was read, if the file is still the same; it is never another one
 * than without reading ahead, only sooner there. The memory for what was read is bounded, and there
 * is no thread while nothing is to be read.
 *
 * Objects of this class may live in any thread, each in one.
 *
 * \since 1.0
 */
class VELUIAUX_EXPORT VelUIEntriesAhead
{
public:
    VelUIEntriesAhead();
    /// Gives up everything that it has begun.
    ~VelUIEntriesAhead();
    VelUIEntriesAhead(const VelUIEntriesAhead &) = delete;
    VelUIEntriesAhead &operator=(const VelUIEntriesAhead &) = delete;

    /**
     * Begins to read a folder; returns at once.
     *
     * @param folder the path of the folder, as the paths of its entries begin; what is no folder has
     *               no entries
     */
    void read(const QString &folder);

    /**
     * Ends that: of what is left nothing will be asked for. Waits for the files that are just being
     * read, of which there are as many as threads at most.
     *
     * @param folder a path that was given to read(); others are ignored
     */
    void giveUp(const QString &folder);

private:
    struct Private;
    std::unique_ptr<Private> d;
};
