// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

class QDialogButtonBox;

/**
 * The buttons Ok and Reset: enabled while there is something to apply or to reset.
 *
 * Ok is the one record of that. The first chord of a recording is a change: Ok can be pressed
 * before the editor is done with the key.
 */
class ChangeButtons
{
public:
    /// The buttons of \a box, which outlives this object.
    explicit ChangeButtons(const QDialogButtonBox *box);

    /// Whether the buttons are enabled.
    bool isChanged() const;
    /// There is something to apply, or there is not, whatever is being recorded.
    void setChanged(bool changed);
    /// A chord was recorded, or the recording is over and what it changed is told by setChanged().
    void setRecording(bool isRecording);

private:
    void enable(bool changed);

    const QDialogButtonBox *const m_box;
    bool m_isRecording = false;
    bool m_isChanged = false; // without the key that is being recorded
};
