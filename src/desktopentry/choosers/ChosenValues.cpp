// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ChosenValues.h"

namespace VelUI {

ChosenValues::ChosenValues(const QStringList &values)
    : m_first(values)
{
}

bool ChosenValues::contains(const QString &value) const
{
    return wasChosen(value) ? !m_removed.contains(value) : m_added.contains(value);
}

bool ChosenValues::wasChosen(const QString &value) const
{
    return m_first.contains(value);
}

void ChosenValues::set(const QString &value, bool isChosen)
{
    if (isChosen == contains(value))
        return;
    QStringList &list = wasChosen(value) ? m_removed : m_added;
    if (list.contains(value))
        list.removeAll(value);
    else
        list.append(value);
}

QStringList ChosenValues::values() const
{
    QStringList values;
    for (const QString &value : m_first) {
        if (!m_removed.contains(value))
            values.append(value);
    }
    return values + m_added;
}

int ChosenValues::count() const
{
    QStringList values = this->values();
    values.removeDuplicates();
    return values.size();
}

} // namespace VelUI
