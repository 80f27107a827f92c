// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "BusActivation.h"

#include <QDBusConnection>
#include <QDBusError>
#include <QDBusMessage>
#include <QElapsedTimer>
#include <QFile>
#include <QFileInfo>
#include <QVariantMap>

namespace {

constexpr int AnswerTime = 1100; // milliseconds

// Without an address the bus library would start a bus of its own.
bool hasSessionBus()
{
    return !qEnvironmentVariableIsEmpty("DBUS_SESSION_BUS_ADDRESS")
        || (!qEnvironmentVariableIsEmpty("XDG_RUNTIME_DIR")
            && QFile::exists(QFile::decodeName(qgetenv("XDG_RUNTIME_DIR")) + QLatin1String("/bus")));
}

QString objectPath(QString name)
{
    name.replace(QLatin1Char('.'), QLatin1Char('/')).replace(QLatin1Char('-'), QLatin1Char('_'));
    return QLatin1Char('/') + name;
}

QVariantMap platformData()
{
    QVariantMap data;
    const QString startupId = QString::fromLocal8Bit(qgetenv("DESKTOP_STARTUP_ID"));
    if (!startupId.isEmpty())
        data.insert(QStringLiteral("desktop-startup-id"), startupId);
    return data;
}

} // namespace

bool activateOnBus(const QString &path)
{
    const QString name = QFileInfo(path).completeBaseName();
    if (!hasSessionBus())
        return false;
    const QDBusConnection bus = QDBusConnection::sessionBus();
    if (!bus.isConnected())
        return false;

    // A file may have a name that is none on a bus; the call fails at once then.
    QDBusMessage call = QDBusMessage::createMethodCall(
        name, objectPath(name), QStringLiteral("org.freedesktop.Application"), QStringLiteral("Activate"));
    call.setArguments({platformData()});
    QElapsedTimer timer;
    timer.start();
    const QDBusMessage answer = bus.call(call, QDBus::Block, AnswerTime);
    if (answer.type() == QDBusMessage::ReplyMessage)
        return true;
    // Who has not answered in time has been found and takes its time to start; who went away gives
    // the same error, but at once. The bus library's timer may be a twentieth early.
    return QDBusError(answer).type() == QDBusError::NoReply && timer.elapsed() >= AnswerTime * 3 / 4;
}
