// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QByteArray>
#include <QString>

/**
 * What every fuzz target is made of. A target is one source that defines Fuzz::test().
 *
 * Most inputs are a first line, with which something is done, and behind it the bytes of a file.
 */
namespace Fuzz {

/// Tries one input. To be defined by the target.
void test(const QByteArray &input);

/// Ends the program as a finding unless \a holds; \a what says what should have held.
void require(bool holds, const char *what);

/// An input in two.
struct Parts
{
    QByteArray head; ///< the first line without its line feed
    QByteArray rest; ///< all that follows; empty without a line feed
};
Parts cut(const QByteArray &input);

/// A folder of this process alone, which is also its home.
QString folder();
/// Writes \a bytes to \a name in folder(), over what was there; returns the path.
QString write(const char *name, const QByteArray &bytes);
/// The bytes of the file \a path.
QByteArray read(const QString &path);

} // namespace Fuzz
