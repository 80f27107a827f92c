// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>

/// What the keys of an entry are for, in words for its user.
namespace KeyDescription {

/// What \a key is for; empty for a key that the form does not show.
QString of(const QString &key);

/// Adds that the value is for the users of one language.
QString ofTranslation(const QString &key);

} // namespace KeyDescription
