// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "KeySequences.h"

#include "KeyNames.h"

bool KeySequences::isKnown(const QKeySequence &sequence)
{
    for (int i = 0; i < sequence.count(); ++i) {
        if ((sequence[uint(i)] & ~int(Qt::KeyboardModifierMask)) == Qt::Key_unknown)
            return false;
    }
    return true;
}

QKeySequence KeySequences::fromText(const QString &text, QKeySequence::SequenceFormat format)
{
    const QKeySequence sequence(text, format);
    return isKnown(sequence) ? sequence : QKeySequence();
}

QKeySequence KeySequences::fromSavedText(const QString &text)
{
    return fromText(text, QKeySequence::NativeText);
}

bool KeySequences::survivesSaving(const QKeySequence &sequence)
{
    // Almost every key is one of these, and parsing takes its time.
    const bool isUsual = sequence.count() == 1 && !(sequence[0] & int(Qt::GroupSwitchModifier))
        && KeyNames::roundTrips(sequence[0]);
    if (isUsual || sequence.isEmpty())
        return true;
    const QString text = sequence.toString(QKeySequence::PortableText);
    return fromText(text, QKeySequence::PortableText) == sequence && fromSavedText(text) == sequence;
}
