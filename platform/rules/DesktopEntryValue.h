// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>
#include <QStringList>

#include <optional>
#include <string>
#include <string_view>
#include <type_traits>

/**
 * The way from the bytes of a value in a desktop entry file to what they mean, and back.
 *
 * Reading knows the escapes \s \n \t \r and \\ , in lists \; too; any other escape stays as
 * it is. What is not valid UTF-8 has no value.
 */
namespace DesktopEntryValue {

/// The bytes as text, without looking at escapes; none if they are not valid UTF-8.
std::optional<QString> decodeUtf8(std::string_view bytes);

/// The text that the bytes of a string value stand for.
std::optional<QString> toText(std::string_view bytes);
/// The items that the bytes of a list stand for; empty items are left out.
std::optional<QStringList> toList(std::string_view bytes);
/// Whether the bytes of a boolean say true.
bool toFlag(std::string_view bytes);

/// toText or toList, by the type of the result.
template <typename T>
std::optional<T> decode(std::string_view bytes)
{
    if constexpr (std::is_same_v<T, QString>)
        return toText(bytes);
    else
        return toList(bytes);
}

/// The bytes that read as \a text.
std::string fromText(const QString &text);
/// The bytes that read as \a items, each followed by ";"; empty items are left out.
std::string fromList(const QStringList &items);

} // namespace DesktopEntryValue
