// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "KeptValue.h"
#include "PropsRow.h"
#include "fields/PlainFields.h"

namespace VelUI {

/// A row whose field shows one key; knows the getter and the setter of the key's value.
template <typename Field, typename Getter, typename Setter>
class KeyRow : public PropsRow
{
public:
    KeyRow(ShownFor shownFor, FormLayout *layout, int number, Field *field, Getter getter, Setter setter)
        : PropsRow(shownFor, layout, number)
        , m_field(field)
        , m_getter(getter)
        , m_setter(setter)
    {
    }

    void load(const VelUIDesktopEntry &entry) override { setFieldValue(m_field, (entry.*m_getter)()); }
    void save(VelUIDesktopEntry *entry) const override { (entry->*m_setter)(fieldValue(m_field)); }
    void putAway() override { m_kept.putAway(m_field); }
    void restore() override { m_kept.restore(m_field); }
    void forget() override { m_kept.forget(); }

private:
    Field *const m_field;
    KeptValue<Field> m_kept;
    const Getter m_getter;
    const Setter m_setter;
};

} // namespace VelUI
