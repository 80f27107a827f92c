// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <frame/DesktopEntryRecord.h>

#include <QList>
#include <QStringList>

class QCheckBox;
class QLineEdit;

namespace VelUI {

class ActionListEdit;
class IconEdit;
class PathEdit;
class StringListEdit;

// One way to read and to write a field, whatever its kind. An empty value clears the field; of a
// value longer than its line the beginning is shown.

QString fieldValue(const QLineEdit *field);
QString fieldValue(const IconEdit *field);
QString fieldValue(const PathEdit *field);
bool fieldValue(const QCheckBox *field);
QStringList fieldValue(const StringListEdit *field);
QList<VelUIDesktopAction> fieldValue(const ActionListEdit *field);

void setFieldValue(QLineEdit *field, const QString &value);
void setFieldValue(IconEdit *field, const QString &value);
void setFieldValue(PathEdit *field, const QString &value);
void setFieldValue(QCheckBox *field, bool value);
void setFieldValue(StringListEdit *field, const QStringList &value);
void setFieldValue(ActionListEdit *field, const QList<VelUIDesktopAction> &value);

} // namespace VelUI
