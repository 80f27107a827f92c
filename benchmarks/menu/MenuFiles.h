// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>
#include <QStringList>
#include <QTemporaryDir>

/**
 * Menu directories to measure on, in a temporary folder that goes with this object. The
 * entries are of the size that real ones have: about 3 KB with names in 40 languages.
 */
class MenuFiles
{
public:
    MenuFiles();

    /// A folder of \a count entries; with \a sorted, its list names them all in another order.
    QString flat(int count, bool sorted);
    /// A folder of \a folders folders with \a count entries each.
    QString nested(int folders, int count);

private:
    void fill(const QString &folder, int count) const;

    QTemporaryDir m_folder;
    int m_made = 0;
};
