// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// A "mime.cache" file; the whole input is the file.

#include "FuzzTarget.h"

#include <icons/MimePatterns.h>

void Fuzz::test(const QByteArray &input)
{
    MimePatterns patterns;
    if (!patterns.addCache(input))
        return;
    patterns.finish();
    for (const char *name : {"", "a", "x.desktop", "archive.tar.gz", "README", "core.1", "\xC3\xA4.TXT"}) {
        const QString text = QString::fromUtf8(name);
        const int suffix = patterns.decidingSuffix(text);
        require(suffix == 0 || (suffix > 0 && suffix < text.size()),
                "the deciding suffix is shorter than the name");
    }
}
