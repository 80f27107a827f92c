// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ContentsDigest.h"

#include <velcore/files.h>

#include <QByteArray>
#include <QCryptographicHash>

#include <sys/stat.h>

std::string contentsDigest(std::string_view bytes)
{
    const QByteArray view = QByteArray::fromRawData(bytes.data(), int(bytes.size()));
    return QCryptographicHash::hash(view, QCryptographicHash::Sha256).toHex().toStdString();
}

std::string fileDigest(const std::filesystem::path &path)
{
    struct stat status = {};
    if (lstat(path.c_str(), &status) != 0 || !S_ISREG(status.st_mode))
        return {};
    const Vel::SmallFile file(path.string());
    return file.isRead() ? contentsDigest(file.bytes()) : std::string();
}
