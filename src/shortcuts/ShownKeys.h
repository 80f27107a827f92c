// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "FurtherKeys.h"

#include <QKeySequence>
#include <QString>

namespace ShownKeys {

/// All keys of a shortcut in one text, the pending one first; empty when it has none.
inline QString of(const IShortcutObject &object,
                  QKeySequence::SequenceFormat format = QKeySequence::PortableText)
{
    QList<QKeySequence> keys = FurtherKeys::of(object);
    if (!object.keySequence().isEmpty())
        keys.prepend(object.keySequence());
    return QKeySequence::listToString(keys, format);
}

} // namespace ShownKeys
