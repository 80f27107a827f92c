// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "ShortcutsModel.h"

#include <QPointer>

/**
 * Has a ShortcutsModel tell screen readers which shortcuts are changed, for as long as it lives.
 *
 * The model does so with roles that it has no data for otherwise. Several may live at a time.
 */
class SpokenChanges
{
public:
    explicit SpokenChanges(ShortcutsModel *model);
    ~SpokenChanges();

private:
    Q_DISABLE_COPY(SpokenChanges)
    const QPointer<ShortcutsModel> m_model;
};
