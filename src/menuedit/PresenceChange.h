// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "FileChange.h"
#include "FilePlace.h"
#include "TreeState.h"

#include <memory>

class KeptThing;

/**
 * A file, link or folder that came or went: what was made is put away when that is undone, and what was
 * deleted is brought back.
 */
class PresenceChange : public FileChange
{
public:
    /// Something was made at \a path.
    explicit PresenceChange(const QString &path);
    /// What was at \a path is kept now as \a deleted.
    PresenceChange(const QString &path, std::unique_ptr<KeptThing> deleted);
    ~PresenceChange() override;

    QStringList paths() const override { return {path()}; }
    void note() override;
    Refusal check() const override;
    Refusal undo(FileProgress &progress) override;
    Refusal redo(FileProgress &progress) override;

private:
    Refusal putAway();
    Refusal bringBack(FileProgress &progress);
    QString path() const { return m_place.path(); }

    const FilePlace m_place;
    std::unique_ptr<KeptThing> m_kept; // null while it is at its path
    TreeState m_state; // at the path
    const bool m_wasMade;
};
