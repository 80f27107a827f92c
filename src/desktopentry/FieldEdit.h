// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QVariant>

#include <functional>

class QObject;
class QWidget;

namespace VelUI {

/// Changes of a field that count as the user's: whoever listens to the user hears of them.
namespace FieldEdit {

/// The value of a field of the form: a text, a list of texts or of actions, or a bool; invalid for
/// other fields.
QVariant value(const QWidget *field);
bool areEqual(const QVariant &left, const QVariant &right);

/// Gives the field another value, as if the user had typed or chosen it.
void setValue(QWidget *field, const QVariant &value);

/// Shows another value; those who listen to the user hear nothing.
void show(QWidget *field, const QVariant &value);

/// Calls \a react when the user edited the field, for as long as \a context lives.
void onEdited(QWidget *field, QObject *context, const std::function<void()> &react);

/// Gives the focus to the field, to its line if it has one.
void focus(QWidget *field);

} // namespace FieldEdit

} // namespace VelUI
