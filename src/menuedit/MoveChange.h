// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "FileChange.h"
#include "FilePlace.h"
#include "TreeState.h"

/**
 * A file, link or folder that went from one place to another.
 *
 * Undone, it lies where it was, with what it holds by then; a link has the text again that it had there.
 */
class MoveChange : public FileChange
{
public:
    /// What is at \a from is about to be moved to \a to.
    MoveChange(const QString &from, const QString &to);

    /// Whether it was moved.
    bool hasHappened() const;

    QStringList paths() const override { return {m_from.path(), m_to.path()}; }
    void note() override;
    Refusal check() const override;
    Refusal undo(FileProgress &progress) override;
    Refusal redo(FileProgress &progress) override;

private:
    Refusal move(const FilePlace &to, const QByteArray &linkText, FileProgress &progress);

    const FilePlace m_from;
    const FilePlace m_to;
    const QByteArray m_linkTextBefore;
    QByteArray m_linkTextAfter;
    bool m_isMoved = true;
    TreeState m_state;
};
