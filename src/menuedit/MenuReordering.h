// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QModelIndexList>
#include <QStringList>

class MenuVoice;
class QString;
class ShownMenu;

/**
 * Writing the order of a folder after the user's wishes. Items are those of the file model.
 */
namespace MenuReordering {

/// Lists \a name in \a folder before the child at the source row \a row; see ShownOrder::with().
/// False when there is no such folder; of a list that cannot be saved the \a voice tells.
bool list(const ShownMenu &menu, MenuVoice &voice, const QString &name, int row, const QModelIndex &folder);

/// Makes \a list the order of the directory \a folder; when it cannot be saved, the \a voice tells.
void write(const ShownMenu &menu, MenuVoice &voice, const QString &folder, const QStringList &list);

/// Moves \a item by one place up or down, and shows the new order.
void move(const ShownMenu &menu, MenuVoice &voice, const QModelIndex &item, bool up);

/// The same for several \a items of one folder; see BlockMove::byOne().
void moveAll(const ShownMenu &menu, MenuVoice &voice, const QModelIndexList &items, bool up);

} // namespace MenuReordering
