// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "Refusal.h"

#include <QString>

/**
 * A path, with the folder that it lay in when this was made.
 */
class FilePlace
{
public:
    explicit FilePlace(const QString &path);

    QString path() const { return m_path; }
    /// Whether something can be put there: the folder is the one that it was, and nothing is there.
    Refusal checkFree() const;

private:
    QString m_path;
    QString m_folder; // without links
};
