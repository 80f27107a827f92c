// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ContainingFolder.h"

#include <QDBusConnection>
#include <QDBusMessage>
#include <QDBusPendingCallWatcher>
#include <QFile>
#include <QFileInfo>
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

QDBusMessage callFor(const QString &path)
{
    const QString name = QStringLiteral("org.freedesktop.FileManager1");
    QDBusMessage call = QDBusMessage::createMethodCall(name, QStringLiteral("/org/freedesktop/FileManager1"),
                                                       name, QStringLiteral("ShowItems"));
    const QString url = QString::fromLatin1(QUrl::fromLocalFile(path).toEncoded());
    call.setArguments({QStringList{url}, QString()});
    return call;
}

} // namespace

void ContainingFolder::show(QWidget *owner, const QString &path, const EntryExecution::Failed &failed)
{
    const auto open = [owner, path, failed] { EntryExecution::start(owner, QFileInfo(path).path(), failed); };
    if (!hasSessionBus() || !QDBusConnection::sessionBus().isConnected()) {
        open();
        return;
    }
    auto *answer = new QDBusPendingCallWatcher(
        QDBusConnection::sessionBus().asyncCall(callFor(path), AnswerTime), owner);
    QObject::connect(answer, &QDBusPendingCallWatcher::finished, owner, [answer, open] {
        answer->deleteLater();
        if (answer->isError())
            open();
    });
}
