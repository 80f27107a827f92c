// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "KeySequences.h"

#include "KeyNames.h"

#include <frame/QtMajor.h>

namespace {

int withoutModifiers(int code)
{
    return code & ~int(Qt::KeyboardModifierMask);
}

// Half a character is none, and no text file of Qt 6's keeps it.
bool isKey(int code)
{
    const int key = withoutModifiers(code);
    return key != Qt::Key_unknown && !QChar::isSurrogate(uint(key));
}

// Almost every key is one of these, and parsing takes its time. Other names may stand for another
// key in the user's language: in Hungarian, Enter is the name of Return.
bool hasOneName(int code)
{
    const int key = withoutModifiers(code);
    const bool isNamed = key > Qt::Key_AsciiTilde && (key < Qt::Key_F1 || key > Qt::Key_F35);
    return isKey(code) && !isNamed && !(code & int(Qt::GroupSwitchModifier)) && KeyNames::roundTrips(code);
}

} // namespace

bool KeySequences::isKnown(const QKeySequence &sequence)
{
    for (int i = 0; i < sequence.count(); ++i) {
        if (!isKey(QtMajor::chord(sequence, i)))
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
    if (sequence.isEmpty() || (sequence.count() == 1 && hasOneName(QtMajor::chord(sequence, 0))))
        return true;
    const QString text = sequence.toString(QKeySequence::PortableText);
    return fromText(text, QKeySequence::PortableText) == sequence && fromSavedText(text) == sequence;
}
