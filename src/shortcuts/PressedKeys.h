// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "KeyRecording.h"

#include <QElapsedTimer>
#include <QKeySequence>
#include <QVector>

/**
 * The keys that a user presses to look for them.
 *
 * A chord that comes soon after another one continues it, up to four; a later one begins anew.
 */
class PressedKeys
{
public:
    /// Takes note of a key event; tells whether it was the press of a chord.
    bool take(const QKeyEvent &event);
    /// What was pressed; empty at first.
    QKeySequence keys() const;
    /// Forgets what was pressed.
    void clear();

private:
    KeyRecording m_recording; // knows what is no chord, and held keys
    QVector<int> m_chords;
    QElapsedTimer m_sinceLast;
};
