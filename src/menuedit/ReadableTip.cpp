// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ReadableTip.h"

#include <QAbstractItemView>
#include <QEvent>
#include <QTextDocument>
#include <QToolTip>

namespace {

constexpr int LookInterval = 20; // milliseconds, as the others
// A window that nobody activates again has its tip all the same.
constexpr int LongestWait = 500;
constexpr int FirstMoment = 1500;

// A tool tip takes for HTML what looks like it, such as a file name.
QString asPlainText(const QString &text)
{
    if (!Qt::mightBeRichText(text))
        return text;
    return QLatin1String("<qt>") + text.toHtmlEscaped() + QLatin1String("</qt>");
}

} // namespace

ReadableTip::ReadableTip(QAbstractItemView *view)
    : m_view(view)
{
    m_timer.setInterval(LookInterval);
    connect(&m_timer, &QTimer::timeout, this, &ReadableTip::look);
    m_view->viewport()->installEventFilter(this);
}

ReadableTip::~ReadableTip() = default;

void ReadableTip::show(const QString &text, const QModelIndex &at)
{
    m_text = asPlainText(text);
    m_item = at;
    m_sinceAsked.start();
    m_timer.start();
    if (m_view->isActiveWindow() || !m_view->isVisible())
        showNow();
}

bool ReadableTip::eventFilter(QObject *watched, QEvent *event)
{
    switch (event->type()) {
    case QEvent::ToolTip:
        return isShown();
    case QEvent::MouseButtonPress:
    case QEvent::Wheel:
        m_timer.stop(); // the user goes on
        break;
    default:
        break;
    }
    return QObject::eventFilter(watched, event);
}

void ReadableTip::look()
{
    if (m_sinceAsked.elapsed() > FirstMoment)
        m_timer.stop();
    const bool isTimeToShow = m_view->isActiveWindow() || m_sinceAsked.elapsed() > LongestWait;
    if (isTimeToShow && m_view->isVisible() && !isShown())
        showNow();
}

void ReadableTip::showNow()
{
    const QRect area = m_item.isValid() ? m_view->visualRect(m_item) : QRect();
    const QRect viewport = m_view->viewport()->rect();
    const QPoint place = area.intersects(viewport) ? area.bottomLeft() : viewport.center();
    QToolTip::showText(m_view->viewport()->mapToGlobal(place), m_text, m_view->viewport());
}

bool ReadableTip::isShown() const
{
    return !m_text.isEmpty() && QToolTip::isVisible() && QToolTip::text() == m_text;
}
