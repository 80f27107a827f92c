// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <string>
#include <string_view>

/// The names of groups and keys that the record classes know.
namespace DesktopEntryNames {

constexpr std::string_view MainGroup = "Desktop Entry";
constexpr std::string_view ActionGroupPrefix = "Desktop Action ";

constexpr std::string_view Type = "Type";
constexpr std::string_view Version = "Version";
constexpr std::string_view Name = "Name";
constexpr std::string_view GenericName = "GenericName";
constexpr std::string_view Comment = "Comment";
constexpr std::string_view Icon = "Icon";
constexpr std::string_view Exec = "Exec";
constexpr std::string_view TryExec = "TryExec";
constexpr std::string_view Path = "Path";
constexpr std::string_view Url = "URL";
constexpr std::string_view StartupWMClass = "StartupWMClass";
constexpr std::string_view StartupNotify = "StartupNotify";
constexpr std::string_view Terminal = "Terminal";
constexpr std::string_view NoDisplay = "NoDisplay";
constexpr std::string_view Hidden = "Hidden";
constexpr std::string_view OnlyShowIn = "OnlyShowIn";
constexpr std::string_view NotShowIn = "NotShowIn";
constexpr std::string_view MimeType = "MimeType";
constexpr std::string_view Categories = "Categories";
constexpr std::string_view Keywords = "Keywords";
constexpr std::string_view SortOrder = "SortOrder";
constexpr std::string_view Actions = "Actions";
constexpr std::string_view DBusActivatable = "DBusActivatable";
constexpr std::string_view PrefersNonDefaultGpu = "PrefersNonDefaultGPU";
constexpr std::string_view SingleMainWindow = "SingleMainWindow";

inline bool isActionGroup(std::string_view group)
{
    return group.substr(0, ActionGroupPrefix.size()) == ActionGroupPrefix;
}

inline std::string actionGroup(std::string_view id)
{
    std::string group;
    group.reserve(ActionGroupPrefix.size() + id.size());
    return group.append(ActionGroupPrefix).append(id);
}

} // namespace DesktopEntryNames
