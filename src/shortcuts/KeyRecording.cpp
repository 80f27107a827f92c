// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "KeyRecording.h"

#include "RecordedKey.h"

#include <QKeyEvent>

bool KeyRecording::movesTheFocus(const QKeyEvent &event)
{
    return (event.key() == Qt::Key_Tab || event.key() == Qt::Key_Backtab)
        && !(event.modifiers() & (Qt::ControlModifier | Qt::AltModifier));
}

bool KeyRecording::withholds(const QKeyEvent &event)
{
    if (movesTheFocus(event))
        return false;
    if (isRepeated(event))
        return true;
    const bool isModifier = RecordedKey::isModifier(event.key());
    if (!isModifier && !RecordedKey::isChord(event.key(), event.modifiers()))
        return true;
    // It may be for Shift+Tab, and the key that waits must not go with it.
    if (isModifier && m_isHeld)
        return true;
    if (event.type() == QEvent::KeyPress) {
        if (m_isHeld)
            stop();
        m_isActive = true;
        m_hasChord = m_hasChord || !isModifier;
    }
    return false;
}

// A held key comes as releases and presses. Where Qt has not yet seen the press when it handles
// the release, it does not call them repeated; that they come at the same time gives them away.
bool KeyRecording::isRepeated(const QKeyEvent &event)
{
    if (event.isAutoRepeat())
        return true;
    if (event.type() == QEvent::KeyPress)
        return event.timestamp() != 0 && event.timestamp() == m_releaseTime && event.key() == m_releasedKey;
    m_releaseTime = event.timestamp();
    m_releasedKey = event.key();
    return false;
}

void KeyRecording::hold()
{
    m_isActive = true;
    m_hasChord = true;
    m_isHeld = true;
}

void KeyRecording::stop()
{
    m_isActive = false;
    m_hasChord = false;
    m_isHeld = false;
}
