// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QStringList>

/**
 * What is told of many items at once.
 */
namespace FewLines {

/// The \a lines one below the other; of many the first ones, and how many more there are.
QString of(const QStringList &lines);

} // namespace FewLines
