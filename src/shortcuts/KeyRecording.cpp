// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "KeyRecording.h"

#include "RecordedKey.h"

#include <QKeyEvent>

namespace {

// The key editor is left with these.
bool movesTheFocus(const QKeyEvent &event)
{
    return (event.key() == Qt::Key_Tab || event.key() == Qt::Key_Backtab)
        && !(event.modifiers() & (Qt::ControlModifier | Qt::AltModifier));
}

} // namespace

bool KeyRecording::withholds(const QKeyEvent &event)
{
    if (movesTheFocus(event))
        return false;
    if (!RecordedKey::isModifier(event.key()) && !RecordedKey::isChord(event.key(), event.modifiers()))
        return true;
    m_isActive = m_isActive || event.type() == QEvent::KeyPress;
    return false;
}

void KeyRecording::stop()
{
    m_isActive = false;
}
