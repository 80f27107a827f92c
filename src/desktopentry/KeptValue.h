// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "fields/PlainFields.h"

#include <optional>
#include <utility>

namespace VelUI {

/// What a field showed before its row was hidden: the user may want the row back.
template <typename Field>
class KeptValue
{
public:
    /// Empties \a field; a value that was put away before stays where the field is empty since.
    void putAway(Field *field)
    {
        if (!m_value)
            m_value = fieldValue(static_cast<const Field *>(field));
        setFieldValue(field, Value{});
    }

    /// Shows the value again, once.
    void restore(Field *field)
    {
        if (m_value)
            setFieldValue(field, *std::exchange(m_value, std::nullopt));
    }

    void forget() { m_value.reset(); }

private:
    using Value = decltype(fieldValue(std::declval<const Field *>()));

    std::optional<Value> m_value;
};

} // namespace VelUI
