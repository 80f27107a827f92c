// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "PlainFields.h"

#include <QCheckBox>
#include <QLineEdit>

namespace VelUI {

QString fieldValue(const QLineEdit *field)
{
    return field->text();
}

void setFieldValue(QLineEdit *field, const QString &value)
{
    field->setText(value);
    field->setCursorPosition(0);
}

bool fieldValue(const QCheckBox *field)
{
    return field->isChecked();
}

void setFieldValue(QCheckBox *field, bool value)
{
    field->setChecked(value);
}

} // namespace VelUI
