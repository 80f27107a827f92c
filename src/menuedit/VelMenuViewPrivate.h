// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>

class VelMenuViewPrivate
{
public:
    QString menuDir;
};
