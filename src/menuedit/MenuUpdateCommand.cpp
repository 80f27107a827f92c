// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuUpdateCommand.h"

#include <frame/QtMajor.h>

#include <velcore/dirs.h>

#include <velintegration/wmcommand.h>

// Last: the macros of Xlib's header hide names of Qt.
#include <X11/Xlib.h>

namespace {

constexpr VelDir Kinds[] = {VelDir::StartMenu, VelDir::Desktop, VelDir::ToolBar};

} // namespace

int MenuUpdateCommand::kindOf(const QString &dir)
{
    for (const VelDir kind : Kinds) {
        if (dir == QString::fromStdString(GetVelDir(kind)))
            return static_cast<int>(kind);
    }
    return NoKind;
}

QByteArray MenuUpdateCommand::forKind(int kind)
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

bool MenuUpdateCommand::isHeard()
{
    Display *const display = QtMajor::x11Display();
    if (!display)
        return false;
    const std::string selection = VelWmCommand::selectionName(DefaultScreen(display));
    return XGetSelectionOwner(display, XInternAtom(display, selection.c_str(), False)) != None;
}

bool MenuUpdateCommand::send(const QByteArray &command)
{
    return SendCommandToWM(QtMajor::x11Display(), command.constData());
}
