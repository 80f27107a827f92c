// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QStringList>

class QFileSystemModel;

/// Has \a model take \a names as what its thread found in \a folder, as a listing that was made before other
/// files came; false when this Qt has no such way.
bool takeOlderListing(QFileSystemModel *model, const QString &folder, const QStringList &names);
