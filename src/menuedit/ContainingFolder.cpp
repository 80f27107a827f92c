// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ContainingFolder.h"

#include "EntryExecution.h"

#include <QDBusConnection>
#include <QDBusMessage>
#include <QDBusPendingCallWatcher>
#include <QFile>
#include <QFileInfo>
#include <QPointer>
#include <QUrl>
#include <QWidget>

namespace {

constexpr int AnswerTime = 10000; // milliseconds; a file manager may have to be started

// Without an address the bus library would start a bus of its own.
bool hasSessionBus()
{
    return !qEnvironmentVariableIsEmpty("DBUS_SESSION_BUS_ADDRESS")
        || (!qEnvironmentVariableIsEmpty("XDG_RUNTIME_DIR")
            && QFile::exists(QFile::decodeName(qgetenv("XDG_RUNTIME_DIR")) + QLatin1String("/bus")));
}

QDBusMessage callFor(const QStringList &paths)
{
    const QString name = QStringLiteral("org.freedesktop.FileManager1");
    QDBusMessage call = QDBusMessage::createMethodCall(name, QStringLiteral("/org/freedesktop/FileManager1"),
                                                       name, QStringLiteral("ShowItems"));
    QStringList urls;
    for (const QString &path : paths)
        urls.append(QString::fromLatin1(QUrl::fromLocalFile(path).toEncoded()));
    call.setArguments({urls, QString()});
    return call;
}

void openFolders(QWidget *owner, const QStringList &paths, const ContainingFolder::Failed &failed)
{
    QStringList folders;
    for (const QString &path : paths)
        folders.append(QFileInfo(path).path());
    folders.removeDuplicates();
    const QPointer<QWidget> self(owner);
    for (const QString &folder : qAsConst(folders)) {
        if (self)
            EntryExecution::start(owner, folder,
                                  [folder, failed](const QString &reason) { failed(folder, reason); });
    }
}

} // namespace

void ContainingFolder::show(QWidget *owner, const QStringList &paths, const Failed &failed)
{
    const auto open = [owner, paths, failed] { openFolders(owner, paths, failed); };
    if (!hasSessionBus() || !QDBusConnection::sessionBus().isConnected()) {
        open();
        return;
    }
    auto *answer = new QDBusPendingCallWatcher(
        QDBusConnection::sessionBus().asyncCall(callFor(paths), AnswerTime), owner);
    QObject::connect(answer, &QDBusPendingCallWatcher::finished, owner, [answer, open] {
        answer->deleteLater();
        if (answer->isError())
            open();
    });
}
