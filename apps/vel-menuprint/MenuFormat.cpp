// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuFormat.h"

#include <QString>

namespace {

using MenuFormat::Format;

constexpr Format Formats[] = {
    {"dmenu", true, false, false, false, MenuFormat::dmenu, nullptr},
    {"fluxbox", true, true, false, true, MenuFormat::fluxbox, MenuFormat::fluxboxText},
    {"icewm", true, false, false, true, MenuFormat::icewm, MenuFormat::icewmText},
    {"json", false, false, true, false, MenuFormat::json, nullptr},
    {"jwm", true, false, false, false, MenuFormat::jwm, MenuFormat::jwmText},
    {"labwc", true, false, false, false, MenuFormat::labwc, MenuFormat::openboxText},
    {"openbox", true, false, false, false, MenuFormat::openbox, MenuFormat::openboxText},
    {"rofi", true, false, false, false, MenuFormat::rofi, nullptr},
    {"text", false, false, false, false, MenuFormat::text, nullptr},
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
