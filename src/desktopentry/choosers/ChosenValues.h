// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QStringList>

namespace VelUI {

/**
 * The values that are chosen, in their order.
 *
 * Those that were chosen from the beginning keep their places, also when they are taken out and
 * put back, and also where one stands twice. New ones follow in the order in which they came.
 */
class ChosenValues
{
public:
    explicit ChosenValues(const QStringList &values = {});

    bool contains(const QString &value) const;
    /// Whether \a value was chosen from the beginning.
    bool wasChosen(const QString &value) const;
    /// Chooses \a value, or takes it out.
    void set(const QString &value, bool isChosen);
    QStringList values() const;
    /// How many different ones are chosen.
    int count() const;

private:
    QStringList m_first;
    QStringList m_removed; // of the first
    QStringList m_added;
};

} // namespace VelUI
