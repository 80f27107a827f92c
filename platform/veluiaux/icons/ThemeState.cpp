// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ThemeState.h"

#include <QIcon>
#include <QStringList>

namespace {

struct Settings
{
    QString theme;
    QString fallbackTheme;
    QStringList paths;
    QStringList fallbackPaths;

    bool operator==(const Settings &other) const
    {
        return theme == other.theme && fallbackTheme == other.fallbackTheme && paths == other.paths
            && fallbackPaths == other.fallbackPaths;
    }
};

Settings currentSettings()
{
    return {QIcon::themeName(), QIcon::fallbackThemeName(), QIcon::themeSearchPaths(),
            QIcon::fallbackSearchPaths()};
}

struct State
{
    Settings settings;
    quint64 generation = 0;
};

State &state()
{
    static State state;
    return state;
}

} // namespace

quint64 ThemeState::generation()
{
    State &known = state();
    Settings now = currentSettings();
    if (known.generation == 0 || !(now == known.settings)) {
        known.settings = std::move(now);
        ++known.generation;
    }
    return known.generation;
}

void ThemeState::reload()
{
    // Setting the paths, even to what they are, is what makes Qt drop what it knows.
    QIcon::setThemeSearchPaths(QIcon::themeSearchPaths());
    ++state().generation;
}
