// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

class QKeyEvent;

/**
 * How far the recording of a key has come, by the events on their way to the key editor.
 *
 * It begins with the press of a modifier or of a chord, and lasts until it is stopped. A key that
 * is held down is pressed once.
 */
class KeyRecording
{
public:
    /// Takes note of a key event; tells whether the key editor must not see it.
    bool withholds(const QKeyEvent &event);
    /// Whether a key moves the focus, as in every widget: the key editor is left with it.
    static bool movesTheFocus(const QKeyEvent &event);

    /// Whether a key was pressed. An empty key that the editor announces meanwhile is no key
    /// that the user chose.
    bool isActive() const { return m_isActive; }
    /// Whether a chord was pressed.
    bool hasChord() const { return m_hasChord; }

    /// It ended, but its key waits for a decision; the next press begins another recording.
    void hold();
    /// Whether a key waits for a decision.
    bool isHeld() const { return m_isHeld; }
    /// It ended or was dropped.
    void stop();

private:
    bool isRepeated(const QKeyEvent &event);

    bool m_isActive = false;
    bool m_hasChord = false;
    bool m_isHeld = false;
    unsigned long m_releaseTime = 0; // in milliseconds, by the clock of the events
    int m_releasedKey = 0;
};
