// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>

namespace VelUI {

/// The label of the field that holds a key in the user's language: "Name" gives "Name [de]".
QString localizedLabel(const QString &label);
/// The same for another language.
QString localizedLabel(const QString &label, const QString &language);

} // namespace VelUI
