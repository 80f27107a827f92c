// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuReplacement.h"

#include "ExactMove.h"
#include "KeptThing.h"
#include "OnDisk.h"

namespace {

std::unique_ptr<KeptThing> keep(const QString &path)
{
    std::unique_ptr<KeptThing> kept = KeptThing::inTrash(path);
    return kept ? std::move(kept) : KeptThing::beside(path);
}

} // namespace

MenuReplacement::MenuReplacement(const QString &folder, const QString &previous,
                                 std::unique_ptr<KeptThing> older)
    : m_folder(folder)
    , m_previous(previous)
    , m_older(std::move(older))
{
}

MenuReplacement::~MenuReplacement() = default;

void MenuReplacement::note()
{
    m_stateOfFolder = TreeState(m_folder);
    m_stateOfPrevious = TreeState(m_previous);
}

Refusal MenuReplacement::check() const
{
    // The new folder leaves the disk for the trash, so it has to be the one that was built.
    const bool isSame =
        m_isReplaced ? m_stateOfFolder == TreeState(m_folder) : m_stateOfFolder.isAt(m_folder);
    if (!isSame)
        return OnDisk::exists(m_folder) ? Refusal::changed(m_folder) : Refusal::gone(m_folder);
    if (m_stateOfPrevious.exists() ? !m_stateOfPrevious.isAt(m_previous) : OnDisk::exists(m_previous))
        return Refusal::changed(m_previous);
    if (m_isReplaced)
        return m_older && !m_older->isThere() ? Refusal::lost(m_previous) : Refusal::none();
    return m_newer->isThere() ? Refusal::none() : Refusal::lost(m_folder);
}

// The old folder is back in one step, whatever becomes of the rest.
Refusal MenuReplacement::undo(FileProgress &)
{
    if (const Refusal refusal = Refusal::failed(m_folder, exchange()))
        return refusal;
    m_newer = keep(m_previous);
    if (m_newer && putBack(m_older)) {
        m_isReplaced = false;
        return Refusal::none();
    }
    if (!m_newer || putBack(m_newer))
        exchange();
    return Refusal::notTrashed(m_folder);
}

Refusal MenuReplacement::redo(FileProgress &progress)
{
    if (OnDisk::exists(m_previous) && !(m_older = keep(m_previous)))
        return Refusal::notTrashed(m_previous);
    std::error_code error = m_newer->bringBack(m_previous, progress);
    if (!error) {
        error = exchange();
        if (!error) {
            m_newer.reset();
            m_isReplaced = true;
            return Refusal::none();
        }
        m_newer = keep(m_previous);
    }
    putBack(m_older);
    return Refusal::failed(m_folder, error);
}

std::error_code MenuReplacement::exchange() const
{
    return ExactMove::exchange(ExactMove::native(m_folder), ExactMove::native(m_previous));
}

bool MenuReplacement::putBack(std::unique_ptr<KeptThing> &kept)
{
    FileProgress nobody;
    if (kept && kept->bringBack(m_previous, nobody))
        return false;
    kept.reset();
    return true;
}
