// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// A key string, as a settings or shortcut file may hold it.

#include "FuzzTarget.h"

#include <shortcuts/KeyNames.h>

void Fuzz::test(const QByteArray &input)
{
    const std::optional<int> code = KeyNames::codeFromKeyString(input);
    const QString portable = KeyNames::fromKeyString(QString::fromLocal8Bit(input));
    if (!code)
        return;
    require(*code != 0, "a key string that is read names a key");
    KeyNames::portableText(*code);
    const QString written = KeyNames::toKeyString(*code);
    if (written.isEmpty() || !KeyNames::roundTrips(*code))
        return;
    const std::optional<int> again = KeyNames::codeFromKeyString(written.toLocal8Bit());
    require(again == code, "a key string that is written reads back as the same key");
}
