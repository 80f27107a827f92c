// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "TreeState.h"

#include <QString>

#include <memory>

class KeptThing;
class StepRecorder;

/**
 * Finds out what comes of building a default menu: the menu that was there stays beside it, in place
 * of an older one, which is put away beforehand.
 */
class RebuildRecord
{
public:
    /// The menu in \a directory is about to be built; \a recorder outlives this.
    RebuildRecord(const QString &directory, StepRecorder &recorder);
    ~RebuildRecord();
    RebuildRecord(const RebuildRecord &) = delete;
    RebuildRecord &operator=(const RebuildRecord &) = delete;

    /// Looks what came of it. Where nothing was built, the older menu is back.
    void finish();

private:
    StepRecorder &m_recorder;
    const QString m_folder; // without links
    const QString m_previous;
    const TreeState m_before;
    std::unique_ptr<KeptThing> m_older;
};
