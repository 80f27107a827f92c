// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "PresenceChange.h"

#include "KeptThing.h"

PresenceChange::PresenceChange(const QString &path)
    : m_place(path)
    , m_wasMade(true)
{
}

PresenceChange::PresenceChange(const QString &path, std::unique_ptr<KeptThing> deleted)
    : m_place(path)
    , m_kept(std::move(deleted))
    , m_wasMade(false)
{
}

PresenceChange::~PresenceChange() = default;

void PresenceChange::note()
{
    m_state = TreeState(path());
}

Refusal PresenceChange::check() const
{
    if (!m_kept) {
        const TreeState now(path());
        return !now.exists() ? Refusal::gone(path())
            : now != m_state ? Refusal::changed(path())
                             : Refusal::none();
    }
    return m_kept->isThere() ? m_place.checkFree() : Refusal::lost(path());
}

Refusal PresenceChange::undo(FileProgress &progress)
{
    return m_wasMade ? putAway() : bringBack(progress);
}

Refusal PresenceChange::redo(FileProgress &progress)
{
    return m_wasMade ? bringBack(progress) : putAway();
}

// What is kept beside goes with the history: only what the user has taken back may be lost then.
Refusal PresenceChange::putAway()
{
    m_kept = KeptThing::inTrash(path());
    if (!m_kept && m_wasMade)
        m_kept = KeptThing::beside(path());
    return m_kept ? Refusal::none() : Refusal::notTrashed(path());
}

Refusal PresenceChange::bringBack(FileProgress &progress)
{
    const Refusal refusal = Refusal::failed(path(), m_kept->bringBack(path(), progress));
    if (!refusal)
        m_kept.reset();
    return refusal;
}
