// SPDX-FileCopyrightText: The veluiextra developers
// SPDX-License-Identifier: LGPL-2.1-or-later

#pragma once

#include "DesktopEntryChanges.h"
#include "DesktopEntryText.h"

#include <QByteArray>

/**
 * Makes the bytes of a file out of its old text and what a record changed.
 *
 * Only the lines of changed keys differ from the old text. A new key stands after the last
 * key of its group, a new language after the last line of its key, a new action group after
 * the last action group with one blank line before it.
 */
namespace DesktopEntryWriter {

QByteArray apply(const DesktopEntryText &text, const DesktopEntryChanges &changes);

} // namespace DesktopEntryWriter
