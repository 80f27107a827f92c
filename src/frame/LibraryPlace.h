// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>

/**
 * What is installed with the library, found from where the library itself lies: what was installed
 * together may be moved together. A static library lies in its program, and has its catalogs there.
 */
namespace LibraryPlace {

/// The folder of the translation catalogs that came with the library; it need not exist. Empty where
/// the library cannot tell where it lies.
QString catalogs();

/// The folder of the icon themes that came with the library, and with its programs; it need not exist.
/// Empty where the library cannot tell where it lies.
QString icons();

/// How the desktop's program \a name is started: by its name where PATH has it, else by its path
/// where it was installed with the library, else by its name.
QString program(const QString &name);

} // namespace LibraryPlace
