// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>
#include <QStringList>
#include <QVector>

/// Which lines of a text differ from those of a former one.
class ChangedLines
{
public:
    enum Kind { Same, Changed, New };

    ChangedLines(const QString &before, const QString &after);

    /// The lines of the text, and what has become of each.
    const QStringList &lines() const { return m_lines; }
    const QVector<Kind> &kinds() const { return m_kinds; }
    int count(Kind kind) const { return m_kinds.count(kind); }
    /// How many lines of the former text have nothing in their place.
    int removed() const { return m_removed; }

private:
    void compare(const QStringList &former);
    void compareBetween(const QStringList &former, int begin, int formerEnd, int end);
    void markGap(int begin, int end, int gone);

    QStringList m_lines;
    QVector<Kind> m_kinds;
    int m_removed = 0;
};
