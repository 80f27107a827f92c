// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QHash>
#include <QKeySequence>
#include <QPersistentModelIndex>
#include <QString>
#include <QVector>

class ShortcutsModel;

/**
 * The rows of a model that stand behind a clash of keys.
 *
 * Keys clash that are equal, and those of which one begins the other.
 */
namespace ClashingRows {

/// The rows of one name.
struct Rows
{
    QModelIndex first; ///< the first that has a key, be it a further one, that clashes
    QVector<QPersistentModelIndex> pending; ///< those whose pending key clashes
};

/// All that stand behind clashes with \a key, by name.
QHash<QString, Rows> of(const ShortcutsModel &model, const QKeySequence &key);

} // namespace ClashingRows
