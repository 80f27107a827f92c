// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ShownKeys.h"

#include "FurtherKeys.h"
#include "ShortcutChange.h"

#include <frame/QtMajor.h>

namespace {

int lengthOfKey(int key)
{
    if (key < Qt::Key_Escape)
        return 1;
    const bool isFunctionKey = key >= Qt::Key_F1 && key <= Qt::Key_F35;
    return isFunctionKey ? 3 : 8;
}

int lengthOf(const QKeySequence &keys)
{
    int length = 0;
    const int count = int(keys.count());
    for (int i = 0; i < count; ++i) {
        const int chord = QtMajor::chord(keys, i);
        length += lengthOfKey(chord & ~int(Qt::KeyboardModifierMask)) + 2;
        length += (chord & int(Qt::CTRL) ? 5 : 0) + (chord & int(Qt::ALT) ? 4 : 0)
            + (chord & int(Qt::SHIFT) ? 6 : 0) + (chord & int(Qt::META) ? 5 : 0);
    }
    return length;
}

} // namespace

QString ShownKeys::of(const IShortcutObject &object, QKeySequence::SequenceFormat format)
{
    QList<QKeySequence> keys = FurtherKeys::of(object);
    if (!object.keySequence().isEmpty())
        keys.prepend(object.keySequence());
    return QKeySequence::listToString(keys, format);
}

int ShownKeys::roughLength(const IShortcutObject &object)
{
    int length = lengthOf(object.keySequence());
    const QList<QKeySequence> furtherKeys = FurtherKeys::of(object);
    for (const QKeySequence &key : furtherKeys)
        length += lengthOf(key);
    return ShortcutChange::isChanged(object) ? length + length / 5 + 4 : length;
}
