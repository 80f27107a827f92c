// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>

namespace QuotedText {

/// A key or value of the shortcut file without the quotes that it may be enclosed in.
inline QString withoutQuotes(QString text)
{
    if (text.startsWith(QLatin1Char('"'))) {
        text.remove(0, 1);
        text.chop(1);
    }
    return text;
}

} // namespace QuotedText
