// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>
#include <QTemporaryDir>

/**
 * A copy of one folder below samples/, for a page that shows or changes its files.
 *
 * The copy is a temporary folder, which is removed with this object.
 */
class SampleFolder
{
public:
    /// Copies the folder samples/\a name: "menu" is a menu directory, "entries" holds single entries.
    explicit SampleFolder(const QString &name);

    /// The folder of the copies.
    QString path() const;
    /// The path of the copy of the file \a name.
    QString filePath(const QString &name) const;

private:
    QTemporaryDir m_folder;
};
