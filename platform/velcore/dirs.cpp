// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include <velcore/dirs.h>

#include "environment.h"
#include "userdirs.h"

namespace {

std::string configurationRoot()
{
    const std::string own = absoluteVariable("VEL_CONFIG_HOME");
    return own.empty() ? xdgConfigHome() + "/vel" : own;
}

// Below "/" itself a second "/" would stand.
std::string below(const std::string &folder, const char *name)
{
    return folder == "/" ? folder + name : folder + "/" + name;
}

} // namespace

std::string GetVelDir(VelDir kind)
{
    switch (kind) {
    case VelDir::WindowManagerConfig:
        return configurationRoot();
    case VelDir::StartMenu:
        return below(configurationRoot(), "startmenu");
    case VelDir::ToolBar:
        return below(configurationRoot(), "toolbar");
    case VelDir::Desktop:
        return userDesktopDirectory();
    case VelDir::Pictures: {
        const std::string data = absoluteVariable("VEL_DATA_DIR");
        return below(data.empty() ? velInstalledDataDir() : data, "pixmaps");
    }
    }
    return {};
}
