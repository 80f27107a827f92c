// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QKeySequence>
#include <QPersistentModelIndex>
#include <QVector>

class ShortcutsModel;

/**
 * The rows of a model that stand behind a clash of keys.
 *
 * Keys clash that are equal, and those of which one begins the other.
 */
namespace ClashingRows {

/// The rows of the shortcuts with a name whose pending key clashes with a key.
QVector<QPersistentModelIndex> of(const ShortcutsModel &model, const QString &name, const QKeySequence &key);

/// The first row of the shortcuts with a name that has a key, be it a further one, that clashes with
/// a key; invalid when there is none.
QModelIndex first(const ShortcutsModel &model, const QString &name, const QKeySequence &key);

} // namespace ClashingRows
