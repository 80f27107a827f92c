// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QLineEdit>

namespace VelUI {

/// Asks the user for a text; an empty result means that there is none.
using InputFunction = QString (*)(QWidget *parent, const QString &title, const QString &label,
                                  QLineEdit::EchoMode mode, const QString &text);

/// The input function where none is given: a prompt with one line.
QString askForText(QWidget *parent, const QString &title, const QString &label, QLineEdit::EchoMode mode,
                   const QString &text);

} // namespace VelUI
