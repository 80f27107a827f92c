// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>

/// The categories of applications in the user's language.
namespace VelUI::CategoryNames {

/// What \a category is called; itself where it is not registered.
QString of(const QString &category);

} // namespace VelUI::CategoryNames
