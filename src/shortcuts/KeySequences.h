// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QKeySequence>

namespace KeySequences {

/// Whether every key of a sequence is known: text that does not parse gives unknown keys.
inline bool isKnown(const QKeySequence &sequence)
{
    for (int i = 0; i < sequence.count(); ++i) {
        if ((sequence[uint(i)] & ~int(Qt::KeyboardModifierMask)) == Qt::Key_unknown)
            return false;
    }
    return true;
}

/// The sequence that a text stands for; empty when the text does not parse.
inline QKeySequence fromText(const QString &text, QKeySequence::SequenceFormat format)
{
    const QKeySequence sequence(text, format);
    return isKnown(sequence) ? sequence : QKeySequence();
}

} // namespace KeySequences
