// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "ShortcutsModel.h"

#include <QPointer>

/**
 * Has a RowsChangedEvent of a ShortcutsModel come to the event filter of an object, for as long as
 * it lives.
 *
 * While there is none of these, a model sends no such events: an application registers thousands of
 * actions before anybody looks at them.
 */
class RowsListening
{
public:
    /// \a listener, which has to live as long as this, filters the events of \a model; null is allowed.
    RowsListening(ShortcutsModel *model, QObject *listener);
    ~RowsListening();

private:
    Q_DISABLE_COPY(RowsListening)
    const QPointer<ShortcutsModel> m_model;
    QObject *const m_listener;
};
