// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "Validator.h"

class QRandomGenerator;

/// Entries with something odd in them.
namespace OddEntries {

/// Every value and line that this file knows, in an entry of its own that is fine otherwise, under file
/// names of every kind.
QVector<Validator::Sample> all();

/// \a bytes with one to three changes: of a value, a key, a line or a byte.
QByteArray changed(const QByteArray &bytes, QRandomGenerator *random);

} // namespace OddEntries
