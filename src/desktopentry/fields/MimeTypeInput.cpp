// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#include "MimeTypeInput.h"

#include <QInputDialog>
#include <QMimeDatabase>

namespace VelUI {

QString mimeTypeFor(const QString &answer)
{
    if (answer.contains(QLatin1Char('/')))
        return answer;
    const QList<QMimeType> types = QMimeDatabase().mimeTypesForFileName(QStringLiteral("a.") + answer);
    return types.isEmpty() ? answer : types.constFirst().name();
}

QString askForMimeType(QWidget *parent, const QString &title, const QString &label, QLineEdit::EchoMode mode,
                       const QString &text)
{
    return mimeTypeFor(QInputDialog::getText(parent, title, label, mode, text));
}

} // namespace VelUI
