// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "EditShortcutsAssistance.h"

EditShortcutsAssistance::EditShortcutsAssistance(const EditShortcutsForm &form, ShortcutsModel *shortcuts)
    : m_form(form)
    , m_model(shortcuts)
{
}

EditShortcutsAssistance::~EditShortcutsAssistance() = default;
