// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "FieldValue.h"

#include "ActionListEdit.h"
#include "fields/IconEdit.h"
#include "fields/PathEdit.h"
#include "fields/StringListEdit.h"

#include <QCheckBox>
#include <QLineEdit>

namespace VelUI {

QString fieldValue(const QLineEdit *field)
{
    return field->text();
}

QString fieldValue(const IconEdit *field)
{
    return field->icon();
}

QString fieldValue(const PathEdit *field)
{
    return field->text();
}

bool fieldValue(const QCheckBox *field)
{
    return field->isChecked();
}

QStringList fieldValue(const StringListEdit *field)
{
    return field->strings();
}

QList<VelUIDesktopAction> fieldValue(const ActionListEdit *field)
{
    return field->actions();
}

void setFieldValue(QLineEdit *field, const QString &value)
{
    field->setText(value);
    field->setCursorPosition(0);
}

void setFieldValue(IconEdit *field, const QString &value)
{
    field->setIcon(value);
}

void setFieldValue(PathEdit *field, const QString &value)
{
    field->setText(value);
}

void setFieldValue(QCheckBox *field, bool value)
{
    field->setChecked(value);
}

void setFieldValue(StringListEdit *field, const QStringList &value)
{
    field->setStrings(value);
}

void setFieldValue(ActionListEdit *field, const QList<VelUIDesktopAction> &value)
{
    field->setActions(value);
}

} // namespace VelUI
