// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "MenuWalk.h"

#include <QString>
#include <QStringList>
#include <QVector>

#include <functional>

/**
 * The order in which a menu that is wholly expanded would show some of its items.
 */
namespace FoundOrder {

/// The name under which the menu shows an item.
using NameOf = std::function<QString(const MenuWalk::Item &item)>;

/// The paths of \a items, which lie below \a menuDirectory, from top to bottom. Reads the lists of
/// the folders on the way.
QStringList sorted(const QString &menuDirectory, const QVector<MenuWalk::Item> &items, const NameOf &nameOf);

} // namespace FoundOrder
