// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "WindowManagers.h"

namespace {

using WindowManagers::Settings;

constexpr Settings AllSettings[] = {
    // Fluxbox includes a file in its menu, and reads it anew where it has another time.
    {"fluxbox",
     "mkdir -p ~/.fluxbox && vel-menuprint --format fluxbox >~/.fluxbox/vel-menu.new"
     " && mv ~/.fluxbox/vel-menu.new ~/.fluxbox/vel-menu",
     true},
    {"icewm", "", false},
    {"jwm", "", false},
    // labwc asks for a menu inside another each time, but for the root menu only when it is configured.
    {"labwc", "labwc --reconfigure", false},
    {"openbox", "openbox --reconfigure", false},
};

} // namespace

const Settings *WindowManagers::find(const QString &name)
{
    for (const Settings &settings : AllSettings) {
        if (name == QLatin1String(settings.name))
            return &settings;
    }
    return nullptr;
}

QStringList WindowManagers::names()
{
    QStringList names;
    for (const Settings &settings : AllSettings)
        names.append(QLatin1String(settings.name));
    return names;
}
