// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "DisplayWidth.h"

#include <QString>
#include <QVector>

#include <algorithm>
#include <array>

namespace {

struct Range
{
    uint first;
    uint last;
};

// The wide and full-width characters of Unicode's East Asian Width, in order; neighbors joined
// over characters that are not assigned.
constexpr std::array<Range, 32> WideRanges = {
    {{0x1100, 0x115f},   {0x231a, 0x231b},  {0x2329, 0x232a}, {0x23e9, 0x23ec},   {0x23f0, 0x23f0},
     {0x23f3, 0x23f3},   {0x25fd, 0x25fe},  {0x2614, 0x2615}, {0x2648, 0x2653},   {0x26aa, 0x26ab},
     {0x2705, 0x2705},   {0x270a, 0x270b},  {0x274c, 0x274c}, {0x2753, 0x2755},   {0x2795, 0x2797},
     {0x2b1b, 0x2b1c},   {0x2b50, 0x2b50},  {0x2e80, 0x303e}, {0x3041, 0x33ff},   {0x3400, 0x4dbf},
     {0x4e00, 0xa4cf},   {0xa960, 0xa97f},  {0xac00, 0xd7a3}, {0xf900, 0xfaff},   {0xfe10, 0xfe19},
     {0xfe30, 0xfe6f},   {0xff01, 0xff60},  {0xffe0, 0xffe6}, {0x1b000, 0x1b2ff}, {0x1f300, 0x1f64f},
     {0x1f900, 0x1f9ff}, {0x20000, 0x3fffd}}};

bool isWide(uint character)
{
    const auto *range = std::lower_bound(WideRanges.begin(), WideRanges.end(), character,
                                         [](const Range &one, uint wanted) { return one.last < wanted; });
    return range != WideRanges.end() && range->first <= character;
}

bool isInvisible(uint character)
{
    constexpr uint SoftHyphen = 0xad;
    const QChar::Category category = QChar::category(character);
    return category == QChar::Mark_NonSpacing || category == QChar::Mark_Enclosing
        || (category == QChar::Other_Format && character != SoftHyphen);
}

} // namespace

int DisplayWidth::of(const QString &text)
{
    int width = 0;
    const QVector<uint> characters = text.toUcs4();
    for (const uint character : characters) {
        if (!isInvisible(character))
            width += isWide(character) ? 2 : 1;
    }
    return width;
}
