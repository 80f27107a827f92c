// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "KeptThing.h"

#include "ExactMove.h"
#include "StagingFolder.h"
#include "Trash.h"

KeptThing::KeptThing(const QString &path)
    : m_state(path)
{
}

KeptThing::~KeptThing() = default;

std::unique_ptr<KeptThing> KeptThing::inTrash(const QString &path)
{
    std::unique_ptr<KeptThing> kept(new KeptThing(path));
    kept->m_inTrash = Trash::put(path);
    kept->m_place = ExactMove::native(kept->m_inTrash);
    return kept->m_inTrash.isEmpty() ? nullptr : std::move(kept);
}

std::unique_ptr<KeptThing> KeptThing::beside(const QString &path)
{
    const TreeCopy::Path native = ExactMove::native(path);
    std::unique_ptr<KeptThing> kept(new KeptThing(path));
    kept->m_folder = std::make_unique<StagingFolder>(native.parent_path(), kept->m_nobody);
    kept->m_place = kept->m_folder->item();
    return kept->m_folder->error() || ExactMove::move(native, kept->m_place, kept->m_nobody)
        ? nullptr
        : std::move(kept);
}

bool KeptThing::isThere() const
{
    return m_state.isAt(m_place);
}

std::error_code KeptThing::bringBack(const QString &path, FileProgress &progress)
{
    if (const std::error_code error = ExactMove::move(m_place, ExactMove::native(path), progress))
        return error;
    if (!m_inTrash.isEmpty())
        Trash::forget(m_inTrash);
    m_folder.reset();
    return {};
}
