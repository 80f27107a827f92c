// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>

/**
 * A file that is held open, so that what is judged is what is read, whoever changes the folders
 * and links on the way to it meanwhile.
 */
class HeldFile
{
public:
    /// Opens the file \a path for reading, after links; waits for nobody.
    explicit HeldFile(const QString &path);
    ~HeldFile();
    Q_DISABLE_COPY_MOVE(HeldFile)

    bool isOpen() const { return m_descriptor >= 0; }
    /// Why it is not open; good right after the constructor.
    QString error() const { return m_error; }

    /// A path that leads to this very file, for whoever reads by path.
    QString path() const;

    /**
     * Why a program that the file names is not to be run: the file belongs neither to the user nor
     * to the superuser, may not be executed, and lies in none of the data folders.
     *
     * @return empty when it may be run
     */
    QString whyNotTrusted() const;

private:
    const int m_descriptor;
    const QString m_error;
};
