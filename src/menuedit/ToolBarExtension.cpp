// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ToolBarExtension.h"

#include <frame/QtMajor.h>

#include <QEvent>
#include <QPainter>
#include <QStyle>
#include <QToolBar>
#include <QToolButton>

namespace {

QIcon arrowOf(const QWidget *button)
{
    return button->style()->standardIcon(QStyle::SP_ToolBarHorizontalExtensionButton, nullptr, button);
}

} // namespace

ToolBarExtension::ToolBarExtension(QToolBar *toolBar)
    : m_button(toolBar->findChild<QToolButton *>(QStringLiteral("qt_toolbar_ext_button")))
{
    if (!m_button)
        return;
    m_button->installEventFilter(this);
    paint();
}

ToolBarExtension::~ToolBarExtension()
{
    if (m_button)
        m_button->setIcon(arrowOf(m_button));
}

void ToolBarExtension::paint()
{
    const QSize size(m_button->style()->pixelMetric(QStyle::PM_ToolBarExtensionExtent, nullptr, m_button),
                     m_button->style()->pixelMetric(QStyle::PM_SmallIconSize, nullptr, m_button));
    QPixmap arrow = QtMajor::pixmapFor(*m_button, arrowOf(m_button), size);
    if (arrow.isNull())
        return;
    QPainter painter(&arrow);
    painter.setCompositionMode(QPainter::CompositionMode_SourceIn);
    painter.fillRect(arrow.rect(), m_button->palette().color(QPalette::ButtonText));
    painter.end();
    m_button->setIcon(arrow);
}

// The button takes the arrow of the style anew by itself when the direction is another one.
bool ToolBarExtension::eventFilter(QObject *watched, QEvent *event)
{
    Q_UNUSED(watched)
    if (event->type() == QEvent::Show || event->type() == QEvent::PaletteChange
        || event->type() == QEvent::StyleChange)
        paint();
    return false;
}
