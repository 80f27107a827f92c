// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "StartMenuUpdateTestCase.h"

#include <QDirIterator>

#include <sys/stat.h>

bool StartMenuUpdateTestCase::update(const char *templateDir) const
{
    const QByteArray from =
        templateDir ? QFile::encodeName(path(QString::fromLatin1(templateDir))) : QByteArray();
    return UpdateStartMenu(QFile::encodeName(menu()).constData(), templateDir ? from.constData() : nullptr);
}

void StartMenuUpdateTestCase::uninstall(const QString &name) const
{
    QVERIFY(QFile::remove(path(QStringLiteral("home/applications/") + name)));
}

void StartMenuUpdateTestCase::order(const QString &folderName, const QByteArray &list)
{
    const QString file = inMenu(folderName + QStringLiteral("/.directory"));
    QByteArrayList lines = read(file).split('\n');
    for (QByteArray &line : lines) {
        if (line.startsWith("SortOrder="))
            line = "SortOrder=" + list;
    }
    write(QStringLiteral("config/vel/startmenu/") + folderName + QStringLiteral("/.directory"),
          lines.join('\n'));
}

QStringList StartMenuUpdateTestCase::entries() const
{
    return tree(menu()).keys().filter(QRegularExpression(QStringLiteral("\\.desktop$")));
}

QMap<QString, QString> StartMenuUpdateTestCase::times(const QString &folder)
{
    QMap<QString, QString> times;
    QDirIterator it(folder, QDir::AllEntries | QDir::Hidden | QDir::System | QDir::NoDotAndDotDot,
                    QDirIterator::Subdirectories);
    while (it.hasNext()) {
        const QString path = it.next();
        struct stat status = {};
        if (lstat(QFile::encodeName(path).constData(), &status) != 0)
            continue;
        times.insert(path,
                     QStringLiteral("%1 %2.%3 %4.%5")
                         .arg(status.st_ino)
                         .arg(status.st_mtim.tv_sec)
                         .arg(status.st_mtim.tv_nsec)
                         .arg(status.st_ctim.tv_sec)
                         .arg(status.st_ctim.tv_nsec));
    }
    return times;
}
