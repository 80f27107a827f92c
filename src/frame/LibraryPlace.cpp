// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "LibraryPlace.h"

#include <QCoreApplication>
#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QStandardPaths>

#include <dlfcn.h>

#ifdef VELUIEXTRA_STATIC_DEFINE

// The catalogs are in the program that the library became a part of. Outside of all namespaces, as
// Qt asks for it.
static void provideCatalogs()
{
    Q_INIT_RESOURCE(veluiextra_catalogs);
}

QString LibraryPlace::catalogs()
{
    provideCatalogs();
    return QStringLiteral(":/vel/translations");
}

QString LibraryPlace::icons()
{
    return QDir::cleanPath(QCoreApplication::applicationDirPath()
                           + QLatin1String("/" VEL_ICONS_FROM_PROGRAM));
}

static QString programs()
{
    return QCoreApplication::applicationDirPath();
}

#else

static const char ofThisLibrary = 0;

// The path \a relative to the library's folder. Links are followed first: where /lib is a link, what
// belongs to the library lies beside the folder that it leads to.
static QString beside(const char *relative)
{
    Dl_info info;
    if (!dladdr(&ofThisLibrary, &info) || !info.dli_fname)
        return {};
    const QString library = QFileInfo(QFile::decodeName(info.dli_fname)).canonicalFilePath();
    if (library.isEmpty())
        return {};
    return QDir::cleanPath(QFileInfo(library).path() + QLatin1Char('/') + QFile::decodeName(relative));
}

QString LibraryPlace::catalogs()
{
    return beside(VEL_CATALOGS_FROM_LIBRARY);
}

QString LibraryPlace::icons()
{
    return beside(VEL_ICONS_FROM_LIBRARY);
}

// Its catalogs come with the library wherever it is installed. A build has them, too, but there PATH alone
// says which programs are the desktop's.
static bool isInstalled(const QString &programs)
{
    return QFileInfo(LibraryPlace::catalogs()).isDir()
        && !QFileInfo::exists(programs + QLatin1String("/../CMakeCache.txt"));
}

static QString programs()
{
    const QString folder = beside(VEL_PROGRAMS_FROM_LIBRARY);
    return isInstalled(folder) ? folder : QString();
}

#endif

QString LibraryPlace::program(const QString &name)
{
    if (!QStandardPaths::findExecutable(name).isEmpty())
        return name;
    const QString folder = programs();
    const QString installed = folder.isEmpty() ? QString() : QStandardPaths::findExecutable(name, {folder});
    return installed.isEmpty() ? name : installed;
}
