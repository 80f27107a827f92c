// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "PropsRow.h"

#include "fields/FormLayout.h"

namespace VelUI {

PropsRow::PropsRow(ShownFor shownFor, FormLayout *layout, int number)
    : m_shownFor(shownFor)
    , m_layout(layout)
    , m_number(number)
{
}

PropsRow::~PropsRow() = default;

PropsRow::ShownFor PropsRow::shownFor() const
{
    return m_shownFor;
}

void PropsRow::setVisible(bool visible)
{
    m_layout->setRowVisible(m_number, visible);
}

} // namespace VelUI
