// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "SortOrder.h"

#include <QString>
#include <QStringList>
#include <QVector>

/**
 * The order in which a folder is sorted by name: folders before files, then by the name shown, as a
 * menu stands that nobody has put into another order.
 */
namespace NameOrder {

/// A child of a folder.
struct Child
{
    QString fileName;
    QString name; ///< as shown
    bool isFolder;
};

/// The file names of the \a children by name.
QStringList sorted(const QVector<Child> &children);

/// The file names of the \a children as the \a order of their folder has them shown.
QStringList shown(const QVector<Child> &children, const SortOrder::Index &order);

} // namespace NameOrder
