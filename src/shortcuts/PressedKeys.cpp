// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "PressedKeys.h"

#include "RecordedKey.h"

#include <QKeyEvent>

namespace {

constexpr int MostChords = 4; // as many as a QKeySequence has
constexpr qint64 Pause = 1000; // in milliseconds, as long as the key editor waits

// A symbol that is typed with Shift stands for that: it is "!", not "Shift+!".
bool countsShift(const QString &text)
{
    return text.isEmpty() || !text.at(0).isPrint() || text.at(0).isLetterOrNumber() || text.at(0).isSpace();
}

int chordOf(const QKeyEvent &event)
{
    Qt::KeyboardModifiers modifiers =
        event.modifiers() & (Qt::ControlModifier | Qt::AltModifier | Qt::MetaModifier);
    if ((event.modifiers() & Qt::ShiftModifier) && countsShift(event.text()))
        modifiers |= Qt::ShiftModifier;
    return event.key() | int(modifiers);
}

} // namespace

bool PressedKeys::take(const QKeyEvent &event)
{
    if (m_recording.withholds(event) || event.type() != QEvent::KeyPress
        || RecordedKey::isModifier(event.key()))
        return false;
    if (m_chords.size() == MostChords || !m_sinceLast.isValid() || m_sinceLast.hasExpired(Pause))
        m_chords.clear();
    m_chords.append(chordOf(event));
    m_sinceLast.start();
    return true;
}

QKeySequence PressedKeys::keys() const
{
    return {m_chords.value(0), m_chords.value(1), m_chords.value(2), m_chords.value(3)};
}

void PressedKeys::clear()
{
    m_chords.clear();
    m_recording.stop();
}
