// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MenuVoice.h"

#include <QAbstractItemView>
#include <QPointer>

#include <utility>

MenuVoice::MenuVoice(QAbstractItemView *view, std::function<bool()> isHeard)
    : m_isHeard(std::move(isHeard))
    , m_tip(view)
{
}

MenuVoice::~MenuVoice() = default;

void MenuVoice::tell(const QString &text, Kind kind, const QModelIndex &at, Subject subject)
{
    const QPointer<MenuVoice> self(this);
    m_subject = subject;
    if (m_isHeard())
        Q_EMIT told(text, kind);
    else if (kind != Note)
        m_tip.show(text, at);
    if (self)
        m_subject = Subject::Other;
}
