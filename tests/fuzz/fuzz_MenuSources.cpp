// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// The file that says what a start menu was made from; the whole input is the file.

#include "FuzzTarget.h"

#include <MenuSources.h>

void Fuzz::test(const QByteArray &input)
{
    const auto sources = MenuSources::fromText({input.constData(), std::size_t(input.size())});
    if (!sources)
        return;
    for (const auto &[id, entry] : sources->entries) {
        for (const MenuSources::Version *version : {&entry.made, &entry.next}) {
            require(version->place.empty() || MenuSources::isPlace(version->place),
                    "every entry lies in a folder of the menu");
            require(version->place.find("..") != 0 && version->place.find("/.") == std::string::npos,
                    "no place leads out of the menu");
        }
    }
    const auto again = MenuSources::fromText(sources->toText());
    require(again && again->entries == sources->entries && again->folders == sources->folders
                && again->stamps == sources->stamps,
            "what is written reads as what was read");
}
