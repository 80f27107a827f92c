// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// What a file-system model asks of its icon provider for a folder of 5,000 files.

#include "Comparison.h"

#include <VelMimeTypeIconProvider.h>

#include <QApplication>
#include <QDir>
#include <QFile>
#include <QMimeDatabase>
#include <QTemporaryDir>

#include <cstdio>

namespace {

constexpr int count = 5000;

QByteArray contents(int number)
{
    const QByteArray text = QByteArray::number(number);
    return "[Desktop Entry]\nType=Application\nName=Program " + text + "\nName[de]=Programm " + text
        + "\nComment=One of many\nIcon=program-" + QByteArray::number(number % 100) + "\nExec=true " + text
        + "\nTerminal=false\nCategories=Utility;\n";
}

QFileInfoList writeFiles(const QString &folder, const QString &suffix)
{
    for (int i = 0; i < count; ++i) {
        QFile file(folder + QStringLiteral("/program%1").arg(i) + suffix);
        if (!file.open(QIODevice::WriteOnly) || file.write(contents(i)) < 0)
            return {};
    }
    QFileInfoList infos = QDir(folder).entryInfoList({QLatin1Char('*') + suffix}, QDir::Files, QDir::Name);
    for (QFileInfo &info : infos)
        info.isDir(); // the model's own infos are filled as well
    return infos;
}

qint64 used = 0; // so that no compiler leaves the work out

bool compareTypes(const char *title, const QFileInfoList &files)
{
    const VelMimeTypeIconProvider provider;
    Comparison comparison(title);
    comparison.add("VelMimeTypeIconProvider::type", [&] {
        for (const QFileInfo &file : files)
            used += provider.type(file).size();
    });
    comparison.add("QMimeDatabase::mimeTypeForFile", [&] {
        for (const QFileInfo &file : files)
            used += QMimeDatabase().mimeTypeForFile(file).name().size();
    });
    return comparison.run(9);
}

bool compareIcons(const char *title, const QFileInfoList &files)
{
    const VelMimeTypeIconProvider provider;
    Comparison comparison(title);
    comparison.add("VelMimeTypeIconProvider::icon", [&] {
        for (const QFileInfo &file : files)
            used += provider.icon(file).cacheKey();
    });
    comparison.add("reading every file, no more", [&] {
        for (const QFileInfo &info : files) {
            QFile file(info.filePath());
            if (file.open(QIODevice::ReadOnly | QIODevice::Unbuffered))
                used += file.readAll().size();
        }
    });
    return comparison.run(9);
}

} // namespace

int main(int argc, char **argv)
{
    qputenv("QT_QPA_PLATFORM", "offscreen");
    QApplication application(argc, argv);
    const QTemporaryDir folder;
    const QFileInfoList entries = writeFiles(folder.path(), QStringLiteral(".desktop"));
    const QFileInfoList texts = writeFiles(folder.path(), QStringLiteral(".txt"));
    if (entries.size() != count || texts.size() != count) {
        std::fprintf(stderr, "bench_file_icons: cannot write to %s\n", qPrintable(folder.path()));
        return 1;
    }
    bool kept = compareTypes("MIME names of 5,000 desktop entries", entries);
    kept &= compareTypes("MIME names of 5,000 text files", texts);
    kept &= compareIcons("icons of 5,000 desktop entries, not yet painted", entries);
    return kept && used != 0 ? 0 : 1;
}
