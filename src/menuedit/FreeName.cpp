// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FreeName.h"

#include "OnDisk.h"

#include <frame/EntryPath.h>

namespace FreeName {

Name first(Kind kind, const std::function<bool(const QString &)> &taken)
{
    for (quint64 n = 0;; ++n) {
        const QString number = n == 0 ? QString() : QString::number(n);
        const QString fileName = kind == Kind::Folder
            ? QLatin1String("group") + number
            : EntryPath::entryNamed(QLatin1String("shortcut") + number);
        if (!taken(fileName))
            return {fileName, number};
    }
}

Name firstIn(const QString &folder, Kind kind)
{
    return first(kind, [&folder](const QString &fileName) {
        return OnDisk::exists(folder + QLatin1Char('/') + fileName);
    });
}

} // namespace FreeName
