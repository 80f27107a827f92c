// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "IdleMnemonic.h"

#include <QGroupBox>
#include <QKeySequence>
#include <QShortcutEvent>

namespace {

// More shortcuts than that are not looked through for the one of a title: each look takes as long
// as there are shortcuts in the program.
constexpr int MaximumLooks = 256;

} // namespace

IdleMnemonic::IdleMnemonic(QGroupBox *box)
    : m_box(box)
{
    release(1);
}

void IdleMnemonic::watch(const QEvent &event)
{
    // No key comes before the box was shown or painted with its title.
    if ((event.type() == QEvent::Show || event.type() == QEvent::Paint) && m_box->title() != m_title)
        release(MaximumLooks);
    // One that was not found, after its first key press.
    if (const auto *shortcut = dynamic_cast<const QShortcutEvent *>(&event))
        m_box->setShortcutEnabled(shortcut->shortcutId(), false);
}

// The box keeps the id to itself. Qt counts the ids down, and one that is not the box's own does
// nothing: so all are tried that were given since the last time, the latest first.
void IdleMnemonic::release(int shortcuts)
{
    m_title = m_box->title();
    const int lastId = m_box->grabShortcut(QKeySequence(int(Qt::ALT) | int(Qt::Key_F35)));
    m_box->releaseShortcut(lastId);
    for (int id = lastId + 1; id < m_lastId && id <= lastId + shortcuts; ++id)
        m_box->setShortcutEnabled(id, false);
    m_lastId = lastId;
}
