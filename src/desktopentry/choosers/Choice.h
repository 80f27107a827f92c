// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QIcon>
#include <QString>
#include <QStringList>

namespace VelUI {

/// One of the things that a user may choose.
struct Choice
{
    QString value; ///< what is chosen
    QStringList texts; ///< what the columns show
    QIcon icon;
    QString words; ///< a filter finds it by these too, which no column shows
    int group = 0; ///< those of a lower group stand above the others
};

} // namespace VelUI
