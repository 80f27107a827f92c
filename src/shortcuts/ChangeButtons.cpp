// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ChangeButtons.h"

#include <QDialogButtonBox>
#include <QPushButton>

ChangeButtons::ChangeButtons(const QDialogButtonBox *box)
    : m_box(box)
{
}

bool ChangeButtons::isChanged() const
{
    return m_box->button(QDialogButtonBox::Ok)->isEnabled();
}

void ChangeButtons::setChanged(bool changed)
{
    m_isChanged = changed;
    enable(changed || m_isRecording);
}

void ChangeButtons::setRecording(bool isRecording)
{
    if (isRecording == m_isRecording)
        return;
    m_isRecording = isRecording;
    if (isRecording)
        m_isChanged = isChanged();
    enable(m_isChanged || isRecording);
}

void ChangeButtons::enable(bool changed)
{
    m_box->button(QDialogButtonBox::Ok)->setEnabled(changed);
    m_box->button(QDialogButtonBox::Reset)->setEnabled(changed);
}
