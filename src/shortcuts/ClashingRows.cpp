// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ClashingRows.h"

#include "FurtherKeys.h"
#include "IShortcutObject.h"
#include "ShortcutRows.h"
#include "ShortcutsModel.h"

#include <algorithm>

namespace {

bool clash(const QKeySequence &left, const QKeySequence &right)
{
    return !left.isEmpty() && !right.isEmpty()
        && (left.matches(right) != QKeySequence::NoMatch || right.matches(left) != QKeySequence::NoMatch);
}

// The rows of a name for which a condition holds.
template <typename Condition>
QVector<QPersistentModelIndex> rowsOf(const ShortcutsModel &model, const QString &name,
                                      const Condition &condition)
{
    QVector<QPersistentModelIndex> rows;
    for (int group = 0; group < model.rowCount(); ++group) {
        const QVector<const IShortcutObject *> objects = ShortcutRows::ofGroup(model, group);
        for (int row = 0; row < objects.size(); ++row) {
            const IShortcutObject *object = objects.at(row);
            if (object && object->name() == name && condition(*object))
                rows.append(model.index(row, 0, model.index(group, 0)));
        }
    }
    return rows;
}

} // namespace

QVector<QPersistentModelIndex> ClashingRows::of(const ShortcutsModel &model, const QString &name,
                                                const QKeySequence &key)
{
    return rowsOf(model, name,
                  [&key](const IShortcutObject &object) { return clash(object.keySequence(), key); });
}

QModelIndex ClashingRows::first(const ShortcutsModel &model, const QString &name, const QKeySequence &key)
{
    const QVector<QPersistentModelIndex> rows = rowsOf(model, name, [&key](const IShortcutObject &object) {
        const QList<QKeySequence> further = FurtherKeys::of(object);
        return clash(object.keySequence(), key)
            || std::any_of(further.begin(), further.end(),
                           [&key](const QKeySequence &other) { return clash(other, key); });
    });
    return rows.isEmpty() ? QModelIndex() : QModelIndex(rows.constFirst());
}
