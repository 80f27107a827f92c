// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>
#include <QStringList>

/**
 * The folders that were opened in menus, as the application's default QSettings remember them beside the
 * size of the dialog: for the menus that were changed last in this respect.
 */
namespace OpenedMenus {

/// So many menus are remembered.
constexpr int MostMenus = 20;

/// The folders that were opened in the menu \a directory, paths below it; whatever the settings hold.
QStringList foldersOf(const QString &directory);

/// Remembers \a folders for the menu \a directory. Nothing is written when they are those that are
/// remembered: QSettings waits for whoever holds the lock of its file.
void keep(const QString &directory, const QStringList &folders);

} // namespace OpenedMenus
