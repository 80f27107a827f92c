// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QFileSystemModel>
#include <QSortFilterProxyModel>

/**
 * Shows of a model of files only one folder, the folders above it and what is in it: a model
 * tester would else walk the whole file system.
 */
class OnlyBelow : public QSortFilterProxyModel
{
public:
    OnlyBelow(QAbstractItemModel *model, const QString &folder)
        : m_folder(folder + QLatin1Char('/'))
    {
        setSourceModel(model);
    }

    bool filterAcceptsRow(int row, const QModelIndex &parent) const override
    {
        const QString path =
            sourceModel()->index(row, 0, parent).data(QFileSystemModel::FilePathRole).toString();
        const QString withSlash = path.endsWith(QLatin1Char('/')) ? path : path + QLatin1Char('/');
        return withSlash.startsWith(m_folder) || m_folder.startsWith(withSlash);
    }

private:
    QString m_folder;
};
