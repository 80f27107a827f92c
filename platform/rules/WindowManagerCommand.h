// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>

/// Whether \a exec, the Exec text of an entry, is a command of the window manager's own, for
/// which there is no program.
inline bool isWindowManagerCommand(const QString &exec)
{
    return exec.startsWith(QLatin1String("VELWM_"));
}
