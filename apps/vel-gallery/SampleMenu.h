// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>
#include <QTemporaryDir>

/// A small menu directory in a temporary folder, for pages that show or change one.
class SampleMenu
{
public:
    SampleMenu();

    /// The menu directory; it goes with this object.
    QString path() const;
    /// The path of one entry in it.
    QString entryPath() const;

private:
    QTemporaryDir m_folder;
};
