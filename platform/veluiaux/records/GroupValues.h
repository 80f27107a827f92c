// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "DesktopEntryChanges.h"
#include "DesktopEntryText.h"
#include "MessageLocale.h"

#include <QString>
#include <QStringList>

#include <optional>
#include <string>
#include <string_view>

/**
 * The values of one group: as they stand in a text, and with what was changed since.
 *
 * Finds the group and the user's language once for all values. For use at once, not for
 * keeping: text, changes, the name of the group and the environment have to stay as they are.
 */
class GroupValues
{
public:
    using Value = std::optional<std::string_view>;

    GroupValues(const DesktopEntryText &text, const DesktopEntryChanges &changes, std::string_view group);

    /// The group in the text, unless it is removed.
    int group() const { return m_index; }

    /// The bytes of a value in the text.
    Value base(std::string_view key, std::string_view locale = {}) const;
    /// The bytes of a value with what was changed.
    Value value(std::string_view key, std::string_view locale = {}) const;

    /// The value as QString or QStringList; none if it is missing or malformed.
    template <typename T>
    std::optional<T> read(std::string_view key, std::string_view language = {}) const;
    /// The value in the user's language, and of which variant it is.
    template <typename T>
    std::optional<T> readLocal(std::string_view key, std::string *locale = nullptr) const;

    QString text(std::string_view key, std::string_view language = {}) const
    {
        return read<QString>(key, language).value_or(QString());
    }
    QString localText(std::string_view key) const { return readLocal<QString>(key).value_or(QString()); }
    QStringList list(std::string_view key, std::string_view language = {}) const
    {
        return read<QStringList>(key, language).value_or(QStringList());
    }
    QStringList localList(std::string_view key) const
    {
        return readLocal<QStringList>(key).value_or(QStringList());
    }
    bool flag(std::string_view key) const;

private:
    const MessageLocale &locale() const;

    const DesktopEntryText &m_text;
    const DesktopEntryChanges &m_changes;
    std::string_view m_group;
    int m_index;
    mutable std::optional<MessageLocale> m_locale;
};
