// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QProcess>

#include <unistd.h>

/// A program that leads a process group of its own: whatever it starts can be ended with it.
class GroupLeader : public QProcess
{
public:
#if QT_VERSION_MAJOR >= 6
    GroupLeader()
    {
        setChildProcessModifier([] { ::setpgid(0, 0); });
    }
#else
protected:
    void setupChildProcess() override
    {
        ::setpgid(0, 0);
    }
#endif
};
