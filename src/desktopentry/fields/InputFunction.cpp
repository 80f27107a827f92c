// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "InputFunction.h"

#include <QInputDialog>

namespace VelUI {

QString askForText(QWidget *parent, const QString &title, const QString &label, QLineEdit::EchoMode mode,
                   const QString &text)
{
    return QInputDialog::getText(parent, title, label, mode, text);
}

} // namespace VelUI
