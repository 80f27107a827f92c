// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ClipboardContents.h"

#include "MenuClipboard.h"
#include "WaitCursor.h"

#include <QClipboard>
#include <QEventLoop>
#include <QGuiApplication>
#include <QPointer>

namespace {

// Milliseconds.
constexpr int UntilSilent = 500;
constexpr int LongestWait = 2000;

} // namespace

ClipboardContents::ClipboardContents()
{
    m_patience.setSingleShot(true);
    m_patience.setInterval(UntilSilent);
    connect(&m_patience, &QTimer::timeout, this, &ClipboardContents::noticeSilence);
    connect(&m_question, &ClipboardQuestion::answered, this, &ClipboardContents::take);
    connect(QGuiApplication::clipboard(), &QClipboard::dataChanged, this, &ClipboardContents::look);
    look();
}

ClipboardContents::~ClipboardContents() = default;

// Nobody waits where this process is the owner.
void ClipboardContents::look()
{
    m_question.takeBack();
    m_patience.stop();
    m_isSilent = false;
    m_isForTypes = ClipboardQuestion::isNeeded();
    m_holdsFiles =
        !m_isForTypes && !MenuClipboard::format(QGuiApplication::clipboard()->mimeData()).isEmpty();
    if (m_isForTypes) {
        m_question.askForTypes();
        m_patience.start();
    }
    Q_EMIT changed();
}

// Also an answer that comes late.
void ClipboardContents::take(const QByteArrayList &types)
{
    m_patience.stop();
    m_isSilent = false;
    if (!m_isForTypes)
        return;
    m_isForTypes = false;
    m_holdsFiles = MenuClipboard::areFiles(types);
    Q_EMIT changed();
}

void ClipboardContents::noticeSilence()
{
    m_isSilent = true;
    Q_EMIT changed();
}

// That it has files is no proof that it still sends them: an owner may stop at any time.
bool ClipboardContents::isAnswered()
{
    if (!ClipboardQuestion::isNeeded())
        return true;
    if (m_isSilent || (m_question.isOpen() && !wait()))
        return false;
    m_question.askForData(MenuClipboard::copyFormat().toLatin1());
    return wait();
}

// Whether the question was answered and this object is still there.
bool ClipboardContents::wait()
{
    const QPointer<ClipboardContents> self(this);
    const WaitCursor waiting;
    if (!self)
        return false;
    QEventLoop loop;
    connect(&m_question, &ClipboardQuestion::answered, &loop, &QEventLoop::quit);
    connect(&m_question, &QObject::destroyed, &loop, &QEventLoop::quit);
    QTimer::singleShot(LongestWait, &loop, &QEventLoop::quit);
    if (m_question.isOpen())
        loop.exec(QEventLoop::ExcludeUserInputEvents);
    if (!self)
        return false;
    m_isSilent = m_question.isOpen();
    return !m_isSilent;
}
