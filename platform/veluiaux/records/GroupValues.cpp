// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "GroupValues.h"

#include <DesktopEntryValue.h>

GroupValues::GroupValues(const DesktopEntryText &text, const DesktopEntryChanges &changes,
                         std::string_view group)
    : m_text(text)
    , m_changes(changes)
    , m_group(group)
    , m_index(changes.isRemoved(group) ? DesktopEntryText::NoGroup : text.group(group))
{
}

const MessageLocale &GroupValues::locale() const
{
    if (!m_locale)
        m_locale = MessageLocale::current();
    return *m_locale;
}

GroupValues::Value GroupValues::base(std::string_view key, std::string_view locale) const
{
    const auto place = m_text.key(m_index, key, locale);
    return place ? Value(m_text.value(*place)) : std::nullopt;
}

GroupValues::Value GroupValues::value(std::string_view key, std::string_view locale) const
{
    if (const auto *change = m_changes.find(m_group, key, locale))
        return change->value ? Value(*change->value) : std::nullopt;
    return base(key, locale);
}

template <typename T>
std::optional<T> GroupValues::read(std::string_view key, std::string_view language) const
{
    const Value bytes = value(key, language);
    return bytes ? DesktopEntryValue::decode<T>(*bytes) : std::nullopt;
}

template <typename T>
std::optional<T> GroupValues::readLocal(std::string_view key, std::string *locale) const
{
    const MessageLocale &messages = this->locale();
    Value byRank[MessageLocale::BestRank + 1];
    const auto note = [&](const DesktopEntryText::Key &variant) {
        byRank[messages.rank(m_text.locale(variant))] = m_text.value(variant);
    };
    m_text.forEachVariant(m_index, key, note, messages.language());
    for (int rank = MessageLocale::BestRank; rank > 0; --rank) {
        if (!m_changes.isEmpty()) {
            const std::string wanted = messages.keyLocale(rank);
            if (const auto *change = wanted.empty() ? nullptr : m_changes.find(m_group, key, wanted))
                byRank[rank] = change->value ? Value(*change->value) : std::nullopt;
        }
        // A variant that is malformed does not stand in the way of a less exact one.
        auto result = byRank[rank] ? DesktopEntryValue::decode<T>(*byRank[rank]) : std::nullopt;
        if (!result)
            continue;
        if (locale)
            *locale = messages.keyLocale(rank);
        return result;
    }
    return std::nullopt;
}

template std::optional<QString> GroupValues::read(std::string_view key, std::string_view language) const;
template std::optional<QStringList> GroupValues::read(std::string_view key, std::string_view language) const;
template std::optional<QString> GroupValues::readLocal(std::string_view key, std::string *locale) const;
template std::optional<QStringList> GroupValues::readLocal(std::string_view key, std::string *locale) const;

bool GroupValues::flag(std::string_view key) const
{
    const Value bytes = value(key);
    return bytes && DesktopEntryValue::toFlag(*bytes);
}
