// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>
#include <QStringList>

class QModelIndex;
class QSortFilterProxyModel;

/**
 * The order of a folder as the menu shows it.
 */
namespace ShownOrder {

/// The file names of the children of \a folder of the file model under \a proxy, in the order shown.
/// Children that are gone are left out; those that only a filter leaves out are not.
QStringList of(const QSortFilterProxyModel &proxy, const QModelIndex &folder);

/**
 * The list that keeps the children of a folder in the order shown, with one of them, or a new
 * one, in a place of its own; see SortOrder::rewritten(). Children that are gone are left out;
 * those that only a filter leaves out are not.
 *
 * @param proxy what is shown, above a QFileSystemModel
 * @param name the file name of the one
 * @param row the source row of the child that it is to stand before; the folder's row count in
 *        the file model puts it last, any other row that is not shown does not list it
 * @param folder the folder, in the file model
 */
QStringList with(const QSortFilterProxyModel &proxy, const QString &name, int row, const QModelIndex &folder);
/// The same with several \a names, each once, which stand there in their order.
QStringList with(const QSortFilterProxyModel &proxy, const QStringList &names, int row,
                 const QModelIndex &folder);

} // namespace ShownOrder
