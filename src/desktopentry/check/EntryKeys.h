// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QByteArray>
#include <QString>

/// The keys that the desktop entry standard of freedesktop.org has, and those that it had once.
namespace EntryKeys {

enum class ValueType { Text, TranslatableText, Flag, List, TranslatableList };

struct Key
{
    QByteArray name;
    ValueType type;
    QByteArray onlyFor; ///< the type of the entries that may have it; empty for all
    bool isDeprecated;

    bool isTranslatable() const
    {
        return type == ValueType::TranslatableText || type == ValueType::TranslatableList;
    }
    bool isList() const { return type == ValueType::List || type == ValueType::TranslatableList; }
};

/// The key of \a name; null when the standard has none. The pointer stays good.
const Key *find(const QByteArray &name);

/// Whether the group of an action may have the key \a name.
bool isForActions(const QByteArray &name);

/// Whether \a name marks a key or a group of somebody's own.
bool isExtension(const QByteArray &name);

} // namespace EntryKeys
