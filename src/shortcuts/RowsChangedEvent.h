// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QEvent>

/**
 * Sent by a ShortcutsModel to itself after a shortcut was registered or removed.
 *
 * The model emits no signal then; a view of ours learns of it with RowsListening.
 */
class RowsChangedEvent : public QEvent
{
public:
    RowsChangedEvent()
        : QEvent(eventType())
    {
    }

    /// The type of these events.
    static QEvent::Type eventType()
    {
        static const auto type = static_cast<QEvent::Type>(QEvent::registerEventType());
        return type;
    }
};
