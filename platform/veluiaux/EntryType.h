// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include <QString>

class EntryDocument;

/// Which keys belong to which type of entry.
namespace EntryType {

/// Sets the type; when that changes it, what the standard gives only to the old one goes.
void set(EntryDocument &entry, const QString &type);

} // namespace EntryType
