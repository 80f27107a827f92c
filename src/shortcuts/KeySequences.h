// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QKeySequence>
#include <QString>

namespace KeySequences {

/// Whether every key of a sequence is known: text that does not parse gives unknown keys.
bool isKnown(const QKeySequence &sequence);

/// The sequence that a text stands for; empty when the text does not parse.
QKeySequence fromText(const QString &text, QKeySequence::SequenceFormat format);

/// The sequence that a saved text stands for; empty when the text does not parse.
QKeySequence fromSavedText(const QString &text);

/**
 * Whether a sequence is the same again after it was saved as portable text and loaded.
 *
 * Keys that have no name, for instance, are written as text that stands for other keys.
 */
bool survivesSaving(const QKeySequence &sequence);

} // namespace KeySequences
