// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ChangedLines.h"

namespace {

// Of more lines than these nobody waits for the shortest difference.
constexpr qint64 MostCells = 4000000;

QStringList linesOf(const QString &text)
{
    QStringList lines = text.split(QLatin1Char('\n'));
    if (lines.constLast().isEmpty())
        lines.removeLast();
    return lines;
}

} // namespace

ChangedLines::ChangedLines(const QString &before, const QString &after)
    : m_lines(linesOf(after))
    , m_kinds(m_lines.size(), Same)
{
    compare(linesOf(before));
}

void ChangedLines::compare(const QStringList &former)
{
    int begin = 0;
    int formerEnd = former.size();
    int end = m_lines.size();
    while (begin < qMin(formerEnd, end) && former.at(begin) == m_lines.at(begin))
        ++begin;
    while (qMin(formerEnd, end) > begin && former.at(formerEnd - 1) == m_lines.at(end - 1)) {
        --formerEnd;
        --end;
    }
    if (qint64(formerEnd - begin) * (end - begin) > MostCells)
        markGap(begin, end, formerEnd - begin);
    else
        compareBetween(former, begin, formerEnd, end);
}

// Finds the longest common sequence of lines.
void ChangedLines::compareBetween(const QStringList &former, int begin, int formerEnd, int end)
{
    const int rows = formerEnd - begin;
    const int columns = end - begin;
    QVector<QVector<int>> longest(rows + 1, QVector<int>(columns + 1, 0));
    for (int row = rows - 1; row >= 0; --row) {
        for (int column = columns - 1; column >= 0; --column) {
            longest[row][column] = former.at(begin + row) == m_lines.at(begin + column)
                ? longest[row + 1][column + 1] + 1
                : qMax(longest[row + 1][column], longest[row][column + 1]);
        }
    }
    int row = 0;
    int column = 0;
    int gapRow = 0;
    int gapColumn = 0;
    while (row < rows && column < columns) {
        if (former.at(begin + row) == m_lines.at(begin + column)) {
            markGap(begin + gapColumn, begin + column, row - gapRow);
            gapRow = ++row;
            gapColumn = ++column;
        } else if (longest[row + 1][column] >= longest[row][column + 1]) {
            ++row;
        } else {
            ++column;
        }
    }
    markGap(begin + gapColumn, end, rows - gapRow);
}

// Lines that came where others went are those, changed.
void ChangedLines::markGap(int begin, int end, int gone)
{
    for (int line = begin; line < end; ++line)
        m_kinds[line] = line - begin < gone ? Changed : New;
    m_removed += qMax(0, gone - (end - begin));
}
