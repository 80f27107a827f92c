// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>

/// What one change did to a text: at one place something went and something came.
class TextChange
{
public:
    TextChange(const QString &before, const QString &after);

    /// Where the cursor belongs after the change.
    int end() const { return m_position + m_inserted.size(); }
    /// Whether a single press of a key makes it.
    bool isTyped() const;
    /// Whether it belongs to the same word as \a former, which was made just before.
    bool continues(const TextChange &former) const;

private:
    int m_position;
    QString m_removed;
    QString m_inserted;
};
