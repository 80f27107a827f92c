// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include <veluiaux/VelTrash.h>

#include <QDir>
#include <QDirIterator>
#include <QFile>
#include <QString>

namespace {

QString dataHome()
{
    // A relative path is to be ignored.
    const QString path = QFile::decodeName(qgetenv("XDG_DATA_HOME"));
    return QDir::isAbsolutePath(path) ? path : QDir::homePath() + QStringLiteral("/.local/share");
}

} // namespace

bool VelTrash::isEmpty()
{
    // Hidden files and dangling links can be thrown away too.
    const QDir::Filters everything = QDir::AllEntries | QDir::Hidden | QDir::System | QDir::NoDotAndDotDot;
    return !QDirIterator(dataHome() + QStringLiteral("/Trash/files"), everything).hasNext();
}
