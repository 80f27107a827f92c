// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MoveChange.h"

#include "ExactMove.h"
#include "OnDisk.h"

MoveChange::MoveChange(const QString &from, const QString &to)
    : m_from(from)
    , m_to(to)
    , m_linkTextBefore(TreeState::linkTextAt(from))
{
}

bool MoveChange::hasHappened() const
{
    return !OnDisk::exists(m_from.path()) && OnDisk::exists(m_to.path());
}

void MoveChange::note()
{
    m_state = TreeState(m_isMoved ? m_to.path() : m_from.path());
    if (m_isMoved)
        m_linkTextAfter = m_state.linkText();
}

Refusal MoveChange::check() const
{
    const FilePlace &here = m_isMoved ? m_to : m_from;
    if (!m_state.isAt(here.path()))
        return OnDisk::exists(here.path()) ? Refusal::changed(here.path()) : Refusal::gone(here.path());
    return (m_isMoved ? m_from : m_to).checkFree();
}

Refusal MoveChange::undo(FileProgress &progress)
{
    return move(m_from, m_linkTextBefore, progress);
}

Refusal MoveChange::redo(FileProgress &progress)
{
    return move(m_to, m_linkTextAfter, progress);
}

Refusal MoveChange::move(const FilePlace &to, const QByteArray &linkText, FileProgress &progress)
{
    const TreeCopy::Path from = ExactMove::native((m_isMoved ? m_to : m_from).path());
    const TreeCopy::Path target = ExactMove::native(to.path());
    const bool isSameText = m_linkTextBefore == m_linkTextAfter;
    const Refusal refusal =
        Refusal::failed(to.path(),
                        isSameText ? ExactMove::move(from, target, progress)
                                   : ExactMove::moveLink(from, target, linkText.toStdString()));
    if (!refusal)
        m_isMoved = !m_isMoved;
    return refusal;
}
