// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "EntryFinding.h"
#include "EntryLookups.h"

#include <frame/DesktopEntryRecord.h>

#include <QByteArray>
#include <QString>

/// Tells what is wrong with an entry, by the desktop entry standard and the menu standard of
/// freedesktop.org.
///
/// What desktop-file-validate takes for an error is an error here. Knows no widget, looks at no disk: what
/// only that can tell it asks of EntryLookups, and says nothing about it while the answer is not known.
namespace EntryCheck {

/// What is wrong with \a record, whose file would be \a contents at \a path. Findings about one key
/// follow each other as they stand in the file. Whoever does not know the path gives an empty one.
EntryFindings check(const VelUIDesktopEntry &record, const QByteArray &contents, const QString &path,
                    const EntryLookups &lookups);

} // namespace EntryCheck
