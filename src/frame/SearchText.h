// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>
#include <QStringList>

/**
 * Texts as they are compared when somebody looks for words: blind to case and to accents.
 */
namespace SearchText {

/// \a text as it is compared, which is not fit to be shown.
QString folded(const QString &text);

/// The words of what a user typed, folded; a longer one comes first, as it decides sooner.
QStringList words(const QString &typed);

} // namespace SearchText
