// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QByteArray>
#include <QString>

/**
 * The commands that tell the window manager which of its menus was edited.
 */
namespace MenuUpdateCommand {

/// The kind of a directory that is no standard one.
constexpr int NoKind = -1;

/// The kind of the standard directory whose path is exactly \a dir, or NoKind.
int kindOf(const QString &dir);

/// The command line for a directory of \a kind, line feed included; empty for any other kind.
QByteArray forKind(int kind);

/// Whether anybody takes commands on the application's X display; false off X11, where that shows only when
/// one is sent.
bool isHeard();

/// Sends a command over the application's X display, off X11 without one; whether the window manager has got
/// it.
bool send(const QByteArray &command);

} // namespace MenuUpdateCommand
