// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QByteArray>
#include <QStringList>

struct MenuItem;

/// The forms in which a menu is printed; all of them in UTF-8 and ended by a line feed.
namespace MenuFormat {

/// One of them.
struct Format
{
    const char *name;
    bool isForStarting; ///< gets a ListedMenu with the files of the icons, not the menu as it is edited
    bool hasPicturesOnly; ///< the icons have to be PNG or XPM pictures
    bool hasIconFiles; ///< gets the files of the icons beside their names
    bool hasLines; ///< a path with a line feed cannot be written
    QByteArray (*print)(const MenuItem &menu);
    QByteArray (*printText)(
        const QString &text); ///< a menu with nothing but a text; null where there is none
};

/// The form \a name; null when there is none.
const Format *find(const QString &name);
/// The names of all, in alphabetical order.
QStringList names();

/// A pipe menu of the Openbox window manager; an item runs through vel-open.
QByteArray openbox(const MenuItem &menu);
/// The same with nothing in it but a text.
QByteArray openboxText(const QString &text);

/// The same for the window manager labwc, in whose labels an underscore is nothing but itself.
QByteArray labwc(const MenuItem &menu);

/// What stands between "begin" and "end" in a menu file of the Fluxbox window manager.
QByteArray fluxbox(const MenuItem &menu);
/// The same with nothing in it but a text.
QByteArray fluxboxText(const QString &text);

/// What a "menuprog" of the IceWM window manager prints.
QByteArray icewm(const MenuItem &menu);
/// The same with nothing in it but a text.
QByteArray icewmText(const QString &text);

/// What the "Dynamic" and "Include" tags of the JWM window manager read.
QByteArray jwm(const MenuItem &menu);
/// The same with nothing in it but a text.
QByteArray jwmText(const QString &text);

/// The MenuLines, each with its icon as rofi's dmenu mode takes it.
QByteArray rofi(const MenuItem &menu);

/// The MenuLines alone.
QByteArray dmenu(const MenuItem &menu);

/// A JSON object for each item: kind, name, path, children, and whatever else the item tells of itself.
QByteArray json(const MenuItem &menu);

/// A name on each line, a folder's children indented by four blanks below it. In a name a blank
/// stands for the end of a line and "?" for every other control character.
QByteArray text(const MenuItem &menu);

} // namespace MenuFormat
