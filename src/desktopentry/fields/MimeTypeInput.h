// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QLineEdit>

namespace VelUI {

/// The MIME type that an answer of the user means: a name as it stands, or that of the files
/// with an extension. An extension that no type is registered for comes back as it is.
QString mimeTypeFor(const QString &answer);

/// Asks for a MIME type or a file name extension; see InputFunction.
QString askForMimeType(QWidget *parent, const QString &title, const QString &label, QLineEdit::EchoMode mode,
                       const QString &text);

} // namespace VelUI
