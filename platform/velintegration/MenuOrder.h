// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QStringList>

#include <filesystem>
#include <functional>

/**
 * The order of a folder of the menu, as far as an update changes it: what comes is put where it
 * belongs, what goes is taken out, and all else stays as the user has it.
 */
namespace MenuOrder {

/// Whether the one child belongs before the other.
using IsBefore = std::function<bool(const QString &name, const QString &other)>;

/// \a order with \a name before the first child that belongs behind it. An order without any child,
/// in which at most patterns stand, stays: it is not one of single children.
QStringList inserted(const QStringList &order, const QString &name, const IsBefore &isBefore);

/**
 * Takes children out of the order of a folder and puts others into it that do not stand there; nothing
 * is written when that is the case already. A folder without an order stays so.
 *
 * @return false when it could not be written
 */
bool update(const std::filesystem::path &folder, const QStringList &gone, const QStringList &come,
            const IsBefore &isBefore);

/// The same bytes of a folder's record without its order.
std::string withoutOrder(const std::string &record);

} // namespace MenuOrder
