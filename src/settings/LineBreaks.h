// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>

class QIODevice;

/// What a line cannot hold: a line feed or carriage return in a text would begin another line.
namespace LineBreaks {

/// Whether \a text has a line break.
bool areIn(const QString &text);

/// \a text with a blank in the place of each line break.
QString toBlanks(QString text);

/**
 * Tells on standard error, in one line, that line breaks become blanks.
 *
 * @param device what is written to; a file is named
 * @param place where they stood, as it is named in a sentence
 */
void tell(const QIODevice &device, const QString &place);

} // namespace LineBreaks
