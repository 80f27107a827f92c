// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ListMessage.h"

#include <frame/QtMajor.h>

#include <QAccessible>
#include <QApplication>
#include <QGridLayout>
#include <QLabel>
#include <QPushButton>
#include <QStyle>

namespace VelUI {

namespace {

constexpr int LongestPart = 16;

void alert(QWidget *widget)
{
    QAccessibleEvent event(widget, QAccessible::Alert);
    QAccessible::updateAccessibility(&event);
}

} // namespace

ListMessage::ListMessage(QWidget *parent)
    : QWidget(parent)
    , m_icon(new QLabel(this))
    , m_text(new QLabel(this))
    , m_repair(new QPushButton(this))
{
    const int size = style()->pixelMetric(QStyle::PM_SmallIconSize, nullptr, this);
    const QIcon icon = style()->standardIcon(QStyle::SP_MessageBoxWarning, nullptr, this);
    m_icon->setPixmap(QtMajor::pixmapFor(*this, icon, {size, size}));
    m_text->setObjectName(QStringLiteral("messageLabel"));
    m_text->setTextFormat(Qt::PlainText);
    m_text->setWordWrap(true);
    m_repair->setObjectName(QStringLiteral("repairButton"));

    auto *layout = new QGridLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->setColumnStretch(1, 1);
    layout->addWidget(m_icon, 0, 0, Qt::AlignTop);
    layout->addWidget(m_text, 0, 1);
    layout->addWidget(m_repair, 1, 1, Qt::AlignTrailing);
    connect(m_repair, &QPushButton::clicked, this, &ListMessage::repairWanted);
}

void ListMessage::tell(const QString &text, const QString &repair)
{
    const bool isNew = isHidden() || m_text->text() != text;
    m_text->setText(text);
    m_repair->setText(repair);
    m_repair->setAccessibleDescription(text);
    m_repair->setVisible(!repair.isEmpty());
    show();
    if (isNew)
        alert(m_text);
}

void ListMessage::insist()
{
    QApplication::beep();
    m_repair->setFocus(Qt::OtherFocusReason);
    alert(m_text);
}

QString ListMessage::shortened(const QString &text)
{
    const bool isLong = text.size() > 2 * LongestPart + 1;
    return isLong ? text.left(LongestPart) + QChar(0x2026) + text.right(LongestPart) : text;
}

} // namespace VelUI
