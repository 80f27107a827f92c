// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "Trash.h"

#include "ExactMove.h"
#include "OnDisk.h"
#include "OneStep.h"

#include <QDateTime>
#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QStandardPaths>
#include <QUrl>

#include <climits>

#include <sys/stat.h>

namespace {

constexpr int MostNames = 10000;

// The trash of the home folder, made where there is none; empty where none can be had.
QString homeTrash()
{
    const QString data = QStandardPaths::writableLocation(QStandardPaths::GenericDataLocation);
    const QString trash = data + QStringLiteral("/Trash");
    if (!QFileInfo(trash).isDir()) {
        if (!QDir().mkpath(data) || !QDir().mkdir(trash))
            return QString();
        QFile::setPermissions(trash, QFile::ReadOwner | QFile::WriteOwner | QFile::ExeOwner);
    }
    const QFileInfo info(trash);
    return info.isWritable() && info.isExecutable() ? trash : QString();
}

// The file in a trash that says where the one at \a place was.
QString noteOf(const QString &place)
{
    const QFileInfo info(place);
    return QFileInfo(info.path()).path() + QStringLiteral("/info/") + info.fileName()
        + QStringLiteral(".trashinfo");
}

QByteArray noteFor(const QString &path)
{
    return "[Trash Info]\nPath=" + QUrl::toPercentEncoding(QFileInfo(path).absoluteFilePath(), "/")
        + "\nDeletionDate=" + QDateTime::currentDateTime().toString(Qt::ISODate).toLatin1() + '\n';
}

// So short that a note and a number can be named after it.
QString shortened(QString name)
{
    constexpr int Room = int(sizeof(" 10000.trashinfo"));
    while (QFile::encodeName(name).size() > NAME_MAX - Room)
        name.chop(1);
    return name;
}

// A free place in \a trash for something that was called \a name, and its note opened in \a note; empty
// where no note can be written.
QString freePlace(const QString &trash, const QString &name, QFile *note)
{
    for (int i = 1; i < MostNames; ++i) {
        const QString place =
            trash + QStringLiteral("/files/") + name + (i > 1 ? QStringLiteral(" %1").arg(i) : QString());
        if (OnDisk::exists(place))
            continue;
        note->setFileName(noteOf(place));
        if (note->open(QIODevice::WriteOnly | QIODevice::NewOnly))
            return place;
        if (!OnDisk::exists(note->fileName()))
            return QString();
    }
    return QString();
}

using Move = std::error_code (*)(const TreeCopy::Path &from, const TreeCopy::Path &to);

QString putInHome(const QString &trash, const QString &path, Move move)
{
    const QFileInfo folder(trash + QStringLiteral("/info"));
    if (!QDir(trash).mkpath(QStringLiteral("files")) || !QDir(trash).mkpath(QStringLiteral("info"))
        || !folder.isWritable())
        return QString();
    QFile note;
    const QString place = freePlace(trash, shortened(QFileInfo(path).fileName()), &note);
    const QByteArray text = noteFor(path);
    if (!place.isEmpty() && note.write(text) == text.size() && note.flush()
        && !move(ExactMove::native(path), ExactMove::native(place)))
        return place;
    if (note.isOpen())
        note.remove();
    return QString();
}

std::error_code moveLink(const TreeCopy::Path &from, const TreeCopy::Path &to)
{
    FileProgress nobody;
    return ExactMove::move(from, to, nobody);
}

bool isOnDiskOf(const QString &trash, const QString &path)
{
    struct stat one = {};
    struct stat other = {};
    return ::lstat(QFile::encodeName(path).constData(), &one) == 0
        && ::stat(QFile::encodeName(trash).constData(), &other) == 0 && one.st_dev == other.st_dev;
}

} // namespace

QString Trash::put(const QString &path)
{
    // Without a trash in the home folder Qt takes the current folder for one.
    const QString trash = homeTrash();
    if (trash.isEmpty())
        return QString();
    // Qt goes by what a link leads to: it takes another trash, or none for a link that leads nowhere.
    if (QFileInfo(path).isSymLink())
        return putInHome(trash, path, &moveLink);
    if (isOnDiskOf(trash, path))
        return putInHome(trash, path, &OneStep::rename);
    // Qt tries for ever where it cannot write the note.
    const QString name = QFileInfo(path).fileName();
    QString place;
    return shortened(name) == name && QFile::moveToTrash(path, &place) ? place : QString();
}

void Trash::forget(const QString &place)
{
    QFile::remove(noteOf(place));
}
