// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "TiedLines.h"

#include <QLineEdit>

namespace VelUI {

TiedLines::TiedLines(QLineEdit *base, QLineEdit *local)
    : QObject(base)
    , m_base(base)
    , m_local(local)
{
    // A line tells that it was edited before it tells that its text is another one.
    connect(base, &QLineEdit::textEdited, this, &TiedLines::carry);
    connect(base, &QLineEdit::textChanged, this, [this] {
        if (!m_isCarrying)
            lookAnew();
        m_isCarrying = false;
    });
    connect(local, &QLineEdit::textChanged, this, [this] {
        if (!m_isCarrying)
            lookAnew();
    });
}

void TiedLines::carry(const QString &text)
{
    if (!m_isTied)
        return;
    m_isCarrying = true;
    m_local->setText(text);
    m_local->setCursorPosition(0);
}

void TiedLines::lookAnew()
{
    m_isTied = !m_base->text().isEmpty() && m_base->text() == m_local->text();
}

} // namespace VelUI
