// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "KeyNames.h"

#include <QKeySequence>

#include <array>
#include <optional>
#include <string_view>

/**
 * Compares the keys of the shortcut file with one key sequence.
 *
 * matchesText() is what counts, and it takes microseconds. matches() gives the same answer and
 * decides almost every key by its modifiers, its letter or its number alone.
 */
class KeyMatcher
{
public:
    /// Takes the sequence to compare with.
    explicit KeyMatcher(const QKeySequence &wanted);

    /// Whether \a fileKey, as it stands in the file in UTF-8, is the key sequence.
    bool matches(std::string_view fileKey) const;

    /// The same by way of the texts: clean-up, conversion, parsing.
    bool matchesText(std::string_view fileKey) const;

private:
    struct Parts;

    std::optional<bool> decideByParts(const Parts &parts) const;
    std::optional<bool> decideByCode(const Parts &parts) const;

    const QKeySequence m_wanted;
    int m_wantedKey = 0; // without modifiers; 0 unless the sequence has exactly one key
    std::array<bool, KeyNames::AllModifiers + 1> m_wantedMasks = {}; // by X11 modifier mask
};
