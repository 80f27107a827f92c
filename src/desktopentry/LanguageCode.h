// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>
#include <QStringList>

/// The languages of an entry's keys: "de", "pt_BR", "sr@latin", "ca_ES@valencia".
namespace LanguageCode {

/// Whether \a code is well-formed: a language, and optionally a country and a modifier.
bool isValid(const QString &code);

/// The codes whose values serve users of \a code, the best first.
QStringList served(const QString &code);

/// The one of \a existing that serves users of \a code; empty when none does.
QString inForce(const QString &code, const QStringList &existing);

/// What the language is called by those who speak it; empty when nobody knows.
QString nativeName(const QString &code);

/// The codes of all languages with a name, by their names.
QStringList known();

} // namespace LanguageCode
