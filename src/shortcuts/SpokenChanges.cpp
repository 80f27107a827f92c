// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "SpokenChanges.h"

SpokenChanges::SpokenChanges(ShortcutsModel *model)
    : m_model(model)
{
    if (m_model)
        ++m_model->m_spokenChanges;
}

SpokenChanges::~SpokenChanges()
{
    if (m_model)
        --m_model->m_spokenChanges;
}
