// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <veluiaux/VelUIDesktopAction.h>

#include <QList>

class EntryDocument;

/// The additional actions of an entry: the list of their ids and a group for each.
namespace EntryActions {

QList<VelUIDesktopAction> all(const EntryDocument &entry);
void set(EntryDocument &entry, const QList<VelUIDesktopAction> &actions);

} // namespace EntryActions
