// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "ActionObject.h"

namespace FurtherKeys {

/// The keys of a shortcut beside the pending one, which is the only one that a user changes.
inline QList<QKeySequence> of(const IShortcutObject &object)
{
    const auto *action = qobject_cast<const ActionObject *>(&object);
    return action ? action->furtherKeys() : QList<QKeySequence>();
}

} // namespace FurtherKeys
