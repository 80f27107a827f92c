// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "FileChange.h"
#include "FileContents.h"

#include <optional>

/**
 * A small file, a record above all, that was written, made or removed.
 */
class ContentsChange : public FileChange
{
public:
    /// The file at \a path is about to be written. Through links, what they lead to is meant.
    explicit ContentsChange(const QString &path);

    /// Whether it was written, and can be put back.
    bool hasHappened() const;

    QStringList paths() const override { return {m_named}; }
    void note() override;
    Refusal check() const override;
    Refusal undo(FileProgress &progress) override;
    Refusal redo(FileProgress &progress) override;

private:
    Refusal put(const FileContents &wanted, const FileContents &expected);

    const QString m_named; // as it was given
    const QString m_path;
    const std::optional<FileContents> m_before;
    FileContents m_after;
    bool m_isWritten = true;
};
