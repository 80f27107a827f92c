// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <initializer_list>

class QWidget;

namespace VelUI {

/// The order in which the Tab key comes to the parts of a form.
namespace TabOrder {

/// The last place of \a widgets, or in them, that the Tab key comes to; null when there is none.
QWidget *lastOf(std::initializer_list<QWidget *> widgets);

/// Has the Tab key come to \a widget and what is in it after \a last; nothing when that is null.
void putBehind(QWidget *last, QWidget *widget);

} // namespace TabOrder

} // namespace VelUI
