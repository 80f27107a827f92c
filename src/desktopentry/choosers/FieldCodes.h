// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QCoreApplication>
#include <QString>
#include <QVector>

namespace VelUI {

/// The field codes of a command: what a launcher puts in their places.
class FieldCodes
{
    Q_DECLARE_TR_FUNCTIONS(VelUI::FieldCodes)

public:
    struct Code
    {
        QString code;
        QString explanation; ///< the code and what it stands for
    };

    /// Those that the Desktop Entry Standard has; not the deprecated ones.
    static QVector<Code> all();

    /// Where a code goes that is to be written at \a position of \a command: to the end, if that is before
    /// the program, which is no place for one.
    static int place(const QString &command, int position);

    /// What has to be written at \a position of \a command for \a code to be there, apart from a word
    /// that ends the command there.
    static QString insertion(const QString &command, int position, const QString &code);
};

} // namespace VelUI
