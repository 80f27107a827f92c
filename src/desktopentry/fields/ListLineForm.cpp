// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "ListLineForm.h"

#include <QCoreApplication>
#include <QHBoxLayout>
#include <QLineEdit>
#include <QToolButton>

#include <climits>

namespace VelUI {

void ListLineForm::setupUi(QWidget *widget, const Names &names)
{
    if (widget->objectName().isEmpty())
        widget->setObjectName(QLatin1String(names.form));
    widget->resize(571, 32);

    horizontalLayout = new QHBoxLayout(widget);
    horizontalLayout->setObjectName(QStringLiteral("horizontalLayout"));
    horizontalLayout->setContentsMargins(0, 0, 0, 0);

    line = new QLineEdit(widget);
    line->setObjectName(QLatin1String(names.line));
    line->setMaxLength(INT_MAX);
    line->setReadOnly(true);
    horizontalLayout->addWidget(line);

    button = new QToolButton(widget);
    button->setObjectName(QLatin1String(names.button));
    button->setSizePolicy(QSizePolicy::Fixed, QSizePolicy::Preferred);
    horizontalLayout->addWidget(button);

    widget->setFocusProxy(line);
    widget->setWindowTitle(QCoreApplication::translate(names.form, names.windowTitle));
    button->setText(QCoreApplication::translate(names.form, names.buttonText));
    QMetaObject::connectSlotsByName(widget);
}

void ListLineForm::show(const QStringList &items)
{
    line->setText(items.isEmpty() ? QString() : items.join(QLatin1Char(';')) + QLatin1Char(';'));
    line->setCursorPosition(0);
    line->setReadOnly(true);
}

void ListLineForm::setReadOnly(bool readOnly)
{
    button->setVisible(!readOnly);
}

} // namespace VelUI
