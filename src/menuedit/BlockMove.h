// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QSet>
#include <QString>
#include <QStringList>

/**
 * Moving several children of a folder by one place.
 */
namespace BlockMove {

/**
 * The order of \a all children when the \a moved ones have gone up by one place, or down.
 *
 * Those that stand side by side move together past what stands next to them; those that have come to
 * the end stay there.
 *
 * @param shown the children that can be seen, moved ones among them, in the same order: what they
 *        pass is one of these
 */
QStringList byOne(const QStringList &all, const QStringList &shown, const QSet<QString> &moved, bool up);

} // namespace BlockMove
