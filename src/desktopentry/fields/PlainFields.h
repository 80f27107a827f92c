// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>

class QCheckBox;
class QLineEdit;

namespace VelUI {

// Qt's own fields, read and written as every other field is: fieldValue() and setFieldValue()
// stand beside each kind of field. An empty value clears the field; of a value longer than its
// line the beginning is shown.

QString fieldValue(const QLineEdit *field);
void setFieldValue(QLineEdit *field, const QString &value);

bool fieldValue(const QCheckBox *field);
void setFieldValue(QCheckBox *field, bool value);

} // namespace VelUI
