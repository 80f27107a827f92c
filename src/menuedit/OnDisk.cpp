// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "OnDisk.h"

#include <QFileInfo>

bool OnDisk::exists(const QString &path)
{
    const QFileInfo info(path);
    return info.isSymLink() || info.exists();
}
