// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include <velcore/language.h>

std::string velLanguageCode()
{
    return "en";
}
