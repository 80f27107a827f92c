// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FileLinks.h"

#include <QFile>
#include <QStringList>

FileTransfer::Result FileLinks::make(const QVector<FileTransfer::Item> &items)
{
    QStringList made;
    for (const FileTransfer::Item &item : items) {
        QFile source(item.source);
        if (source.link(item.target)) {
            made.append(item.target);
            continue;
        }
        for (const QString &link : qAsConst(made))
            QFile::remove(link);
        return {FileTransfer::Failure::Failed, item.source, source.errorString()};
    }
    return {};
}
