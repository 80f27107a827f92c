// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "LongWork.h"

#include "WaitCursor.h"

#include <QCoreApplication>
#include <QKeyEvent>
#include <QLabel>
#include <QProgressDialog>
#include <QWindow>

namespace {

constexpr int BeforeWindow = 500; // milliseconds
constexpr int BetweenEvents = 20;

bool isUserInput(QEvent::Type type)
{
    switch (type) {
    case QEvent::KeyPress:
    case QEvent::KeyRelease:
    case QEvent::ShortcutOverride:
    case QEvent::Shortcut:
    case QEvent::MouseButtonPress:
    case QEvent::MouseButtonRelease:
    case QEvent::MouseButtonDblClick:
    case QEvent::MouseMove:
    case QEvent::Wheel:
    case QEvent::ContextMenu:
    case QEvent::TouchBegin:
    case QEvent::DragEnter:
    case QEvent::Drop:
        return true;
    default:
        return false;
    }
}

} // namespace

LongWork::LongWork(QWidget *owner, const QString &title, const QString &text, End end)
    : m_owner(owner)
    , m_title(title)
    , m_text(text)
    , m_end(end)
    , m_cursor(std::make_unique<WaitCursor>())
{
    m_sinceBegun.start();
    m_sinceEvents.start();
    m_isEnded = !m_owner;
}

LongWork::~LongWork()
{
    delete m_window;
}

bool LongWork::goOn()
{
    if (m_isEnded || m_sinceEvents.elapsed() < BetweenEvents)
        return !m_isEnded;
    if (!m_window && m_sinceBegun.elapsed() >= BeforeWindow)
        showWindow();
    showProgress();
    QCoreApplication::processEvents(m_window ? QEventLoop::AllEvents : QEventLoop::ExcludeUserInputEvents);
    m_isEnded = m_isEnded || !m_owner;
    m_sinceEvents.start();
    return !m_isEnded;
}

// Not modal: a key that was pressed before it came up would not reach anybody.
void LongWork::showWindow()
{
    m_cursor.reset();
    m_window = new QProgressDialog(m_owner);
    m_window->setObjectName(QStringLiteral("progressDialog"));
    m_window->setAutoClose(false);
    m_window->setAutoReset(false);
    m_window->setMinimumDuration(24 * 60 * 60 * 1000); // shown below, not by a timer
    m_window->setWindowTitle(m_title);
    auto *label = new QLabel(m_text, m_window);
    label->setTextFormat(Qt::PlainText);
    m_window->setLabel(label);
    if (m_end == End::ByUser)
        m_window->setCancelButtonText(QCoreApplication::translate("VelMenuView", "Cancel"));
    else
        m_window->setCancelButton(nullptr);
    m_window->setRange(0, 0);
    connect(m_window, &QProgressDialog::canceled, this, &LongWork::endByUser);
    QCoreApplication::instance()->installEventFilter(this);
    m_window->show();
}

void LongWork::setProgress(int done, int expected)
{
    m_done = done;
    m_expected = expected;
}

void LongWork::showProgress()
{
    if (!m_window || m_expected == 0)
        return;
    m_window->setMaximum(m_expected);
    m_window->setValue(m_done);
}

bool LongWork::isOwnWindow(const QObject *object) const
{
    if (!m_window)
        return false;
    if (object == m_window->windowHandle())
        return true;
    while (object && object != m_window)
        object = object->parent();
    return object;
}

bool LongWork::eventFilter(QObject *watched, QEvent *event)
{
    if (event->type() == QEvent::Close && !isOwnWindow(watched))
        endByUser();
    if (!isUserInput(event->type()))
        return false;
    if (event->type() == QEvent::KeyPress && static_cast<QKeyEvent *>(event)->key() == Qt::Key_Escape) {
        endByUser();
        return true;
    }
    return !isOwnWindow(watched);
}
