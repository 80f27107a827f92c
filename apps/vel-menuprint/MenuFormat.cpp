// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuFormat.h"

#include <QString>

namespace {

using MenuFormat::Format;

constexpr Format Formats[] = {
    {"dmenu", true, false, false, MenuFormat::dmenu},     {"fluxbox", true, true, true, MenuFormat::fluxbox},
    {"icewm", true, false, true, MenuFormat::icewm},      {"json", false, false, false, MenuFormat::json},
    {"jwm", true, false, false, MenuFormat::jwm},         {"labwc", true, false, false, MenuFormat::openbox},
    {"openbox", true, false, false, MenuFormat::openbox}, {"rofi", true, false, false, MenuFormat::rofi},
    {"text", false, false, false, MenuFormat::text},
};

} // namespace

const Format *MenuFormat::find(const QString &name)
{
    for (const Format &format : Formats) {
        if (name == QLatin1String(format.name))
            return &format;
    }
    return nullptr;
}

QStringList MenuFormat::names()
{
    QStringList names;
    for (const Format &format : Formats)
        names.append(QLatin1String(format.name));
    return names;
}
