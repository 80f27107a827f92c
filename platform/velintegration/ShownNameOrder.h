// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QCollator>
#include <QString>

#include <string>

/// The order of the entries of a new menu: by the names that are shown, in the user's language.
class ShownNameOrder
{
public:
    ShownNameOrder();

    /// Whether the one entry stands before the other; of equal names the files decide.
    bool isBefore(const QString &name, const std::string &file, const QString &otherName,
                  const std::string &otherFile) const;

private:
    QCollator m_collator;
};
