// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <velcore/velcore_export.h>

#include <string>

/**
 * Returns the code of the language that the user's desktop entries are localized in.
 *
 * That is the POSIX message locale (LC_ALL, LC_MESSAGES, LANG, the first that is set and
 * not empty) reduced to the language ("de" for de_DE.UTF-8), except where desktop entries
 * are customarily localized by country or script ("pt_BR", "zh_CN", "sr@latin").
 *
 * @return the code; "en" for the locales "C" and "POSIX" and when none is set
 */
VELCORE_EXPORT std::string velLanguageCode();
