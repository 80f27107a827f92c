// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QByteArray>
#include <QVector>

/// A name in one language, in UTF-8.
struct MenuName
{
    const char *language;
    const char *text;
};

/// The translations of the English name of a menu folder; none for a name that has none.
QVector<MenuName> menuNames(const QByteArray &englishName);
