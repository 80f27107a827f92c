// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ContentsChange.h"

#include "ExactMove.h"

#include <QFileInfo>

namespace {

constexpr int MostLinks = 40; // as the system has it

// Where a file is written that is saved at \a path; a link need not lead to one.
QString writtenAt(const QString &path)
{
    QString target = path;
    for (int i = 0; i < MostLinks && QFileInfo(target).isSymLink(); ++i)
        target = QFileInfo(target).symLinkTarget();
    return target;
}

} // namespace

ContentsChange::ContentsChange(const QString &path)
    : m_named(path)
    , m_path(writtenAt(path))
    , m_before(FileContents::of(ExactMove::native(m_path)))
{
}

bool ContentsChange::hasHappened() const
{
    const std::optional<FileContents> now = FileContents::of(ExactMove::native(m_path));
    return m_before && now && *now != *m_before;
}

void ContentsChange::note()
{
    const std::optional<FileContents> now = FileContents::of(ExactMove::native(m_path));
    if (m_isWritten && now)
        m_after = *now;
}

Refusal ContentsChange::check() const
{
    const FileContents &expected = m_isWritten ? m_after : *m_before;
    const std::optional<FileContents> now = FileContents::of(ExactMove::native(m_path));
    if (now && *now == expected)
        return Refusal::none();
    return now && !now->exists() ? Refusal::gone(m_path) : Refusal::changed(m_path);
}

Refusal ContentsChange::undo(FileProgress &)
{
    return put(*m_before, m_after);
}

Refusal ContentsChange::redo(FileProgress &)
{
    return put(m_after, *m_before);
}

Refusal ContentsChange::put(const FileContents &wanted, const FileContents &expected)
{
    const std::error_code error = wanted.replace(ExactMove::native(m_path), expected);
    if (error == std::errc::file_exists)
        return Refusal::changed(m_path);
    if (error == std::errc::no_such_file_or_directory)
        return Refusal::gone(m_path);
    const Refusal refusal = Refusal::failed(m_path, error);
    if (!refusal)
        m_isWritten = !m_isWritten;
    return refusal;
}
