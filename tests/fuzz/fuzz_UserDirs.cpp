// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

// The file "user-dirs.dirs"; the whole input is the file.

#include "FuzzTarget.h"

#include <velcore/dirs.h>

void Fuzz::test(const QByteArray &input)
{
    write("user-dirs.dirs", input);
    const std::string desktop = GetVelDir(VelDir::Desktop);
    require(!desktop.empty() && desktop.front() == '/', "the desktop folder is an absolute path");
    require(desktop.size() == 1 || desktop.back() != '/', "the desktop folder has no slash at its end");
    require(desktop.find('\n') == std::string::npos, "the desktop folder stands in one line");
}
