// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "IconEdit.h"

#include <KIconButton>

#include <QHBoxLayout>
#include <QLineEdit>

#include <climits>

namespace VelUI {

IconEdit::IconEdit(QWidget *parent)
    : QWidget(parent)
    , m_lineEdit(new QLineEdit(this))
    , m_button(new KIconButton(this))
{
    m_lineEdit->setObjectName(QStringLiteral("lineEdit"));
    m_lineEdit->setMaxLength(INT_MAX);
    m_button->setObjectName(QStringLiteral("iconButton"));
    m_button->setFixedSize(40, 40);
    m_button->setIconSize(32);

    auto *layout = new QHBoxLayout(this);
    layout->setContentsMargins(0, 0, 0, 0);
    layout->addWidget(m_lineEdit);
    layout->addWidget(m_button);
    setFocusProxy(m_lineEdit);

    connect(m_button, &KIconButton::iconChanged, this, &IconEdit::slotIconChanged);
}

void IconEdit::setIcon(const QString &icon)
{
    m_lineEdit->setText(icon);
    m_lineEdit->setCursorPosition(0);
    m_button->setIcon(icon);
}

QString IconEdit::icon() const
{
    return m_lineEdit->text();
}

void IconEdit::setReadOnly(bool readOnly)
{
    m_button->setDisabled(readOnly);
}

void IconEdit::slotIconChanged(const QString &newIcon)
{
    m_lineEdit->setText(newIcon);
    Q_EMIT iconChanged(newIcon);
}

QString fieldValue(const IconEdit *field)
{
    return field->icon();
}

void setFieldValue(IconEdit *field, const QString &value)
{
    field->setIcon(value);
}

} // namespace VelUI
