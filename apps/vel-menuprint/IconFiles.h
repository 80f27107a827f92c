// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>

/**
 * Finds the files of icons in the user's icon theme, without a display.
 */
namespace IconFiles {

/// The name of the icon theme that the user chose: KDE's in a session of KDE, else that of GTK's
/// settings; without either the first of Adwaita, breeze and hicolor that is installed.
QString userTheme();

/// Has find() look in the theme \a name, where icon themes are installed for the user and for all.
void setTheme(const QString &name);

/**
 * The file of the icon \a name for an edge of \a size pixels.
 *
 * @param name a name in the theme or an absolute path
 * @param onlyPictures leaves out drawings
 * @return the absolute path; empty when there is none
 */
QString find(const QString &name, int size, bool onlyPictures);

} // namespace IconFiles
