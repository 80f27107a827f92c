// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "StartMenuTestCase.h"

#include <QDirIterator>

void StartMenuTestCase::init()
{
    TestCase::init();
    qputenv("XDG_DATA_HOME", QFile::encodeName(path(QStringLiteral("home"))));
    qputenv(
        "XDG_DATA_DIRS",
        QFile::encodeName(path(QStringLiteral("local")) + QLatin1Char(':') + path(QStringLiteral("system"))));
    qputenv("LC_ALL", "C.UTF-8");
}

void StartMenuTestCase::cleanup()
{
    qunsetenv("LC_ALL");
    TestCase::cleanup();
}

QMap<QString, QByteArray> StartMenuTestCase::tree(const QString &folder)
{
    QMap<QString, QByteArray> files;
    QDirIterator it(folder, QDir::AllEntries | QDir::Hidden | QDir::System | QDir::NoDotAndDotDot,
                    QDirIterator::Subdirectories);
    while (it.hasNext()) {
        const QString path = it.next();
        const QString name = path.mid(folder.size() + 1);
        files.insert(name,
                     it.fileInfo().isSymLink()   ? QByteArray("link")
                         : it.fileInfo().isDir() ? QByteArray("folder")
                                                 : read(path));
    }
    return files;
}
