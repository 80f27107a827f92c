// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QStringList>

class ClipboardContents;
class MenuVoice;
class QDropEvent;
class QModelIndex;
class QPoint;
class QWidget;
class VelMenuModel;

/**
 * Cut, copy, paste and the question that a drop begins with. Items are those of the file model.
 */
namespace ItemTransfer {

/// Puts \a item on the clipboard, cut when \a action is Qt::MoveAction; empties the clipboard
/// first, and leaves it so for an invalid item.
void put(const VelMenuModel &files, const QModelIndex &item, Qt::DropAction action);

/// The same for the files at the \a paths.
void put(const QStringList &paths, Qt::DropAction action);

/**
 * Moves or copies what is on the clipboard into the folder \a item or to the place of the file
 * \a item. An event loop may run in it.
 *
 * @param contents who knows whether the owner of the clipboard answers; null when nobody does
 * @param voice tells when it does not
 * @return whether something was moved, which it is only once
 */
bool paste(VelMenuModel &files, const QModelIndex &item, ClipboardContents *contents, MenuVoice &voice);

/// The action for \a drop where all that is dropped are web addresses: an entry is made of each, whatever
/// it is called. Qt::IgnoreAction for anything else.
Qt::DropAction actionForAddresses(const QDropEvent &drop);

/// Asks in a menu at the global \a position which of the \a possible actions is to be done with
/// dropped files; Qt::IgnoreAction for nothing. The \a view may go away meanwhile.
Qt::DropAction askForDropAction(QWidget *view, const QPoint &position, Qt::DropActions possible);

} // namespace ItemTransfer
