// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TransferText.h"

#include <QFileSystemModel>

QString TransferText::of(const FileTransfer::Result &result, Qt::DropAction action)
{
    switch (result.failure) {
    case FileTransfer::Failure::None:
    case FileTransfer::Failure::Canceled: // which the user knows
        break;
    case FileTransfer::Failure::SourceGone:
        return QFileSystemModel::tr("%1 does not exist.").arg(result.path);
    case FileTransfer::Failure::TargetExists:
        return QFileSystemModel::tr("%1 exists and was left as it is.").arg(result.path);
    case FileTransfer::Failure::IntoItself:
        return QFileSystemModel::tr("%1 cannot be put into itself.").arg(result.path);
    case FileTransfer::Failure::NotWritable:
        return QFileSystemModel::tr("%1 cannot be written.").arg(result.path);
    case FileTransfer::Failure::Failed:
        return (action == Qt::MoveAction       ? QFileSystemModel::tr("Can't move %1: %2")
                    : action == Qt::LinkAction ? QFileSystemModel::tr("Can't link %1: %2")
                                               : QFileSystemModel::tr("Can't copy %1: %2"))
            .arg(result.path, result.reason);
    }
    return QString();
}
