// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "RowsListening.h"

RowsListening::RowsListening(ShortcutsModel *model, QObject *listener)
    : m_model(model)
    , m_listener(listener)
{
    if (!m_model)
        return;
    m_model->installEventFilter(m_listener);
    ++m_model->m_rowsListeners;
}

RowsListening::~RowsListening()
{
    if (!m_model)
        return;
    m_model->removeEventFilter(m_listener);
    --m_model->m_rowsListeners;
}
