// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "OlderListing.h"

#include <QFileSystemModel>

#if QT_VERSION_MAJOR >= 6

#include <private/qfilesystemmodel_p.h>

#include <memory>

namespace {

// A member in older versions, a pointer in newer ones.
[[maybe_unused]] QObject *objectOf(QFileInfoGatherer &gatherer)
{
    return &gatherer;
}

[[maybe_unused]] QObject *objectOf(const std::unique_ptr<QFileInfoGatherer> &gatherer)
{
    return gatherer.get();
}

} // namespace

bool takeOlderListing(QFileSystemModel *model, const QString &folder, const QStringList &names)
{
    auto *const d = static_cast<QFileSystemModelPrivate *>(QObjectPrivate::get(model));
    return QMetaObject::invokeMethod(objectOf(d->fileInfoGatherer), "newListOfFiles", Qt::DirectConnection,
                                     Q_ARG(QString, folder), Q_ARG(QStringList, names));
}

#else

bool takeOlderListing(QFileSystemModel *model, const QString &folder, const QStringList &names)
{
    return QMetaObject::invokeMethod(model, "_q_directoryChanged", Q_ARG(QString, folder),
                                     Q_ARG(QStringList, names));
}

#endif
