// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "Refusal.h"

#include <QCoreApplication>
#include <QFileInfo>

namespace {

QString nameOf(const QString &path)
{
    return QFileInfo(path).fileName();
}

} // namespace

Refusal Refusal::gone(const QString &path)
{
    return {QCoreApplication::translate("MenuHistory", "%1 is not there any more.").arg(path)};
}

Refusal Refusal::taken(const QString &path)
{
    return {QCoreApplication::translate("MenuHistory", "There is another %1 by now.").arg(path)};
}

Refusal Refusal::changed(const QString &path)
{
    return {QCoreApplication::translate("MenuHistory", "%1 was changed by another program.").arg(path)};
}

Refusal Refusal::lost(const QString &path)
{
    return {QCoreApplication::translate("MenuHistory", "%1 is not in the trash any more.").arg(nameOf(path)),
            true};
}

Refusal Refusal::notTrashed(const QString &path)
{
    return {QCoreApplication::translate("MenuHistory", "%1 cannot be put into the trash.").arg(path)};
}

Refusal Refusal::failed(const QString &path, const std::error_code &error)
{
    if (!error)
        return none();
    if (error == std::errc::file_exists)
        return taken(path);
    if (error == std::errc::operation_canceled)
        return {QCoreApplication::translate("MenuHistory", "It was canceled.")};
    return {QCoreApplication::translate("MenuHistory", "%1 cannot be changed: %2")
                .arg(path, QString::fromLocal8Bit(error.message().c_str()))};
}
