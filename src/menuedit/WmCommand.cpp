// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "WmCommand.h"

#include <velcore/dirs.h>

#include <QX11Info>

// Last: the macros of Xlib's header hide names of Qt.
#include <velintegration/wmcommand.h>

namespace {

constexpr VelDir kinds[] = {VelDir::StartMenu, VelDir::Desktop, VelDir::ToolBar};

} // namespace

int WmCommand::kindOf(const QString &dir)
{
    for (const VelDir kind : kinds) {
        if (dir == QString::fromStdString(GetVelDir(kind)))
            return static_cast<int>(kind);
    }
    return NoKind;
}

QByteArray WmCommand::forKind(int kind)
{
    switch (kind) {
    case static_cast<int>(VelDir::StartMenu):
        return QByteArrayLiteral("VELWM_UPDATE_STARTMENU\n");
    case static_cast<int>(VelDir::Desktop):
        return QByteArrayLiteral("VELWM_UPDATE_SHORTCUT\n");
    case static_cast<int>(VelDir::ToolBar):
        return QByteArrayLiteral("VELWM_UPDATE_TOOLBAR\n");
    default:
        return {};
    }
}

bool WmCommand::send(const QByteArray &command)
{
    return SendCommandToWM(QX11Info::display(), command.constData());
}
