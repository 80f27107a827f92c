// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QByteArray>

struct MenuItem;

/// The forms in which a menu is printed; all of them in UTF-8 and ended by a line feed.
namespace MenuFormat {

/// A pipe menu of the Openbox window manager; an item runs through vel-open.
QByteArray openbox(const MenuItem &menu);

/// A JSON object for each item: kind, name, path, icon, exec, children.
QByteArray json(const MenuItem &menu);

/// A name on each line, a folder's children indented by four blanks below it. In a name a blank
/// stands for the end of a line and "?" for every other control character.
QByteArray text(const MenuItem &menu);

} // namespace MenuFormat
