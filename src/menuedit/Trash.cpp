// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "Trash.h"

#include "ExactMove.h"
#include "OnDisk.h"

#include <QDateTime>
#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QStandardPaths>
#include <QUrl>

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

// A free place in \a trash for something that was called \a name, and its note opened in \a note.
QString freePlace(const QString &trash, const QString &name, QFile *note)
{
    for (int i = 1; i < MostNames; ++i) {
        const QString place =
            trash + QStringLiteral("/files/") + name + (i > 1 ? QStringLiteral(" %1").arg(i) : QString());
        note->setFileName(noteOf(place));
        if (!OnDisk::exists(place) && note->open(QIODevice::WriteOnly | QIODevice::NewOnly))
            return place;
    }
    return QString();
}

// Qt goes by what a link leads to: it takes another trash, or none for a link that leads nowhere.
QString putLink(const QString &trash, const QString &path)
{
    const QFileInfo folder(trash + QStringLiteral("/info"));
    if (!QDir(trash).mkpath(QStringLiteral("files")) || !QDir(trash).mkpath(QStringLiteral("info"))
        || !folder.isWritable())
        return QString();
    FileProgress nobody;
    QFile note;
    const QString place = freePlace(trash, QFileInfo(path).fileName(), &note);
    const QByteArray text = noteFor(path);
    if (!place.isEmpty() && note.write(text) == text.size() && note.flush()
        && !ExactMove::move(ExactMove::native(path), ExactMove::native(place), nobody))
        return place;
    if (note.isOpen())
        note.remove();
    return QString();
}

} // namespace

QString Trash::put(const QString &path)
{
    // Without a trash in the home folder Qt takes the current folder for one.
    const QString trash = homeTrash();
    if (trash.isEmpty())
        return QString();
    if (QFileInfo(path).isSymLink())
        return putLink(trash, path);
    QString place;
    return QFile::moveToTrash(path, &place) ? place : QString();
}

void Trash::forget(const QString &place)
{
    QFile::remove(noteOf(place));
}
