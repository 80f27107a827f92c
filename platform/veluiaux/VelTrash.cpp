// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include <veluiaux/VelTrash.h>

#include <velcore/home.h>

#include <QDir>
#include <QDirIterator>
#include <QFile>
#include <QString>

bool VelTrash::isEmpty()
{
    // Hidden files and dangling links can be thrown away too.
    const QDir::Filters everything = QDir::AllEntries | QDir::Hidden | QDir::System | QDir::NoDotAndDotDot;
    const QString data = QFile::decodeName(Vel::dataHome().c_str());
    return !QDirIterator(data + QStringLiteral("/Trash/files"), everything).hasNext();
}
