// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuFiles.h"

#include <QDateTime>
#include <QDir>
#include <QFile>

#include <algorithm>
#include <random>

namespace {

void write(const QString &path, const QByteArray &bytes)
{
    QFile file(path);
    if (!file.open(QIODevice::WriteOnly) || file.write(bytes) != bytes.size())
        qFatal("cannot write %s", qPrintable(path));
    // Entries of a menu are not younger than the program that shows them.
    file.setFileTime(QDateTime::currentDateTime().addDays(-1), QFileDevice::FileModificationTime);
}

QString fileName(int number)
{
    return QStringLiteral("entry%1.desktop").arg(number);
}

// Names and descriptions in 40 languages, as large as real ones.
QByteArray translations()
{
    QByteArray bytes;
    for (int language = 0; language < 40; ++language) {
        const char code[] = {char('a' + language % 26), char('a' + language / 3), '\0'};
        bytes += QByteArray("Name[") + code + "]=Programm mit einem Namen\n";
        bytes += QByteArray("Comment[") + code + "]=Was das Programm so alles kann\n";
    }
    return bytes;
}

QByteArray entry(int number)
{
    static const char *const icons[] = {"folder",       "edit-copy", "go-up",
                                        "document-new", "edit-find", "user-trash"};
    static const QByteArray others = translations();
    return "[Desktop Entry]\nType=Application\nVersion=1.5\nName=Program " + QByteArray::number(number) + '\n'
        + others
        + "GenericName=Tool\nComment=What it does\nExec=true %f\nTerminal=false\nCategories=Utility;\n"
        + "Icon=" + icons[number % 6] + '\n';
}

} // namespace

MenuFiles::MenuFiles() = default;

void MenuFiles::fill(const QString &folder, int count) const
{
    QDir().mkpath(folder);
    for (int i = 0; i < count; ++i)
        write(folder + QLatin1Char('/') + fileName(i), entry(i));
}

QString MenuFiles::flat(int count, bool sorted)
{
    const QString folder = m_folder.filePath(QStringLiteral("flat%1").arg(m_made++));
    fill(folder, count);
    if (!sorted)
        return folder;
    QStringList names;
    for (int i = 0; i < count; ++i)
        names.append(fileName(i));
    std::shuffle(names.begin(), names.end(), std::mt19937(1));
    write(folder + QStringLiteral("/.directory"),
          "[Desktop Entry]\nType=Directory\nName=Menu\nSortOrder=" + names.join(QLatin1Char(';')).toUtf8()
              + ";\n");
    return folder;
}

QString MenuFiles::nested(int folders, int count)
{
    const QString top = m_folder.filePath(QStringLiteral("nested%1").arg(m_made++));
    for (int i = 0; i < folders; ++i) {
        const QString folder = top + QStringLiteral("/folder%1").arg(i);
        fill(folder, count);
        write(folder + QStringLiteral("/.directory"),
              "[Desktop Entry]\nType=Directory\nName=Folder " + QByteArray::number(i) + "\nIcon=folder\n");
    }
    return top;
}
